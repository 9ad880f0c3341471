#include "messaging/ptc/SocketRemoteSender.h"

#include "messaging/ptc/Event.h"

#include <netinet/in.h>
#include <netinet/tcp.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <memory>

namespace
{

const int DRAIN_SIZE = 10;

void printLine(const char* text)
{
    std::puts(text);
    std::fflush(stdout);
}

} // namespace

SocketRemoteSender::SocketRemoteSender(long id) : PTC::RemoteSender(id)
{
}

SocketRemoteSender::~SocketRemoteSender()
{
    closeSocket();
}

bool SocketRemoteSender::initialize(long identity)
{
    PTC::RemoteSender::initialize(identity);
    return connectServer() == 0;
}

int SocketRemoteSender::connectServer()
{
    closeSocket();
    m_socket = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (m_socket == -1) {
        printLine("[Error]Socket Server create failed!");
        return -1;
    }
    const int on = 1;
    if (setsockopt(m_socket, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on) != 0) {
        printLine("[Error]Socket client reuse address failed!");
        closeSocket();
        return -1;
    }
    const int bufferSize = SocketFrame::RECEIVE_BUFFER_SIZE;
    if (setsockopt(m_socket, SOL_SOCKET, SO_RCVBUF, &bufferSize, sizeof bufferSize) != 0) {
        printLine("[Error]Socket client set send buffer failed!");
        closeSocket();
        return -1;
    }
    setsockopt(m_socket, IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(SocketFrame::portOf(getIdentity()));
    if (address.sin_port == 0 ||
        connect(m_socket, reinterpret_cast<sockaddr*>(&address), sizeof address) != 0) {
        closeSocket();
        return -1;
    }
    return 0;
}

void SocketRemoteSender::send(PTC::Event* event)
{
    const std::unique_ptr<PTC::Event> owner(event);
    if (event == nullptr || m_socket == -1 || event->getSize() < 0 ||
        event->getSize() > SocketFrame::MAX_PAYLOAD) {
        return;
    }
    fillFrame(*event);
    drainAcknowledgements();
    if (!sendFrame()) {
        // Half a frame may be out: whatever followed it would be read in the wrong place.
        closeSocket();
    }
}

void SocketRemoteSender::fillFrame(const PTC::Event& event)
{
    const auto putLong = [this](long offset, std::int64_t value) {
        std::memcpy(m_frame.data() + offset, &value, sizeof value);
    };
    putLong(SocketFrame::RECEIVER_ID, getId());
    putLong(SocketFrame::OBJECT_ID, event.getObjectId());
    putLong(SocketFrame::METHOD_ID, event.getMethodId());
    putLong(SocketFrame::DATA_POINTER,
            static_cast<std::int64_t>(reinterpret_cast<std::intptr_t>(event.getData())));
    putLong(SocketFrame::SIZE, event.getSize());
    m_frame[SocketFrame::IS_CALLBACK] = event.isCallback() ? 1 : 0;
    m_frame[SocketFrame::IS_REMOTE] = event.isRemote() ? 1 : 0;

    const long size = event.getData() != nullptr ? event.getSize() : 0;
    if (size > 0) {
        std::memcpy(m_frame.data() + SocketFrame::HEADER_SIZE, event.getData(),
                    static_cast<std::size_t>(size));
    }
    const long end = SocketFrame::HEADER_SIZE + size;
    if (end < m_usedBytes) {
        std::fill(m_frame.begin() + end, m_frame.begin() + m_usedBytes, '\0');
    }
    m_usedBytes = end;
}

void SocketRemoteSender::drainAcknowledgements()
{
    char scratch[DRAIN_SIZE];
    [[maybe_unused]] const ssize_t taken = recv(m_socket, scratch, sizeof scratch, MSG_DONTWAIT);
}

bool SocketRemoteSender::sendFrame()
{
    long sent = 0;
    while (sent < SocketFrame::FRAME_SIZE) {
        const ssize_t count =
            ::send(m_socket, m_frame.data() + sent, static_cast<std::size_t>(SocketFrame::FRAME_SIZE - sent),
                   MSG_NOSIGNAL | MSG_DONTWAIT);
        if (count > 0) {
            sent += count;
        } else if (count == -1 && (errno == EAGAIN || errno == EWOULDBLOCK)) {
            if (!waitForRoom()) {
                return false;
            }
        } else if (count == 0 || errno != EINTR) {
            return false;
        }
    }
    return true;
}

// Acknowledgements are taken meanwhile: a peer that is held up in sending them would never read on.
bool SocketRemoteSender::waitForRoom()
{
    using Clock = std::chrono::steady_clock;
    const auto deadline = Clock::now() + std::chrono::milliseconds(m_sendTimeoutMs);
    while (true) {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Clock::now()).count();
        if (left <= 0) {
            return false;
        }
        pollfd state{m_socket, POLLIN | POLLOUT, 0};
        const int ready = poll(&state, 1, static_cast<int>(left));
        if (ready == -1 && errno != EINTR) {
            return false;
        }
        if (ready <= 0) {
            continue;
        }
        if ((state.revents & POLLIN) != 0) {
            char scratch[512];
            if (recv(m_socket, scratch, sizeof scratch, MSG_DONTWAIT) == 0) {
                return false; // the peer has closed
            }
        }
        if ((state.revents & (POLLERR | POLLHUP)) != 0) {
            return false;
        }
        if ((state.revents & POLLOUT) != 0) {
            return true;
        }
    }
}

bool SocketRemoteSender::isConnected() const
{
    if (m_socket == -1) {
        return false;
    }
    pollfd state{m_socket, POLLRDHUP, 0};
    return poll(&state, 1, 0) == 0;
}

void SocketRemoteSender::closeSocket()
{
    if (m_socket != -1) {
        close(m_socket);
        m_socket = -1;
    }
}

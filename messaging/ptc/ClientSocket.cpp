#include "messaging/ptc/ClientSocket.h"

#include "messaging/ptc/SocketFrame.h"

#include <linux/sockios.h>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <poll.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <sys/uio.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <cstdio>

namespace
{

const std::array<char, SocketFrame::FRAME_SIZE> ZEROS{};

void printLine(const char* text)
{
    std::puts(text);
    std::fflush(stdout);
}

iovec part(const char* bytes, long size)
{
    return {const_cast<char*>(bytes), static_cast<std::size_t>(size)};
}

} // namespace

ClientSocket::~ClientSocket()
{
    close();
}

bool ClientSocket::open()
{
    m_socket = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
    if (m_socket == -1) {
        printLine("[Error]Socket Server create failed!");
        return false;
    }
    const int on = 1;
    if (setsockopt(m_socket, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on) != 0) {
        printLine("[Error]Socket client reuse address failed!");
        return false;
    }
    const int bufferSize = SocketFrame::RECEIVE_BUFFER_SIZE;
    if (setsockopt(m_socket, SOL_SOCKET, SO_RCVBUF, &bufferSize, sizeof bufferSize) != 0) {
        printLine("[Error]Socket client set send buffer failed!");
        return false;
    }
    setsockopt(m_socket, IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
    return true;
}

ClientSocket::Outcome ClientSocket::beginConnect(unsigned short port)
{
    close();
    if (port == 0 || !open()) {
        close();
        return Outcome::Failed;
    }
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(port);
    m_state = State::Connecting;
    if (connect(m_socket, reinterpret_cast<sockaddr*>(&address), sizeof address) != 0 &&
        errno != EINPROGRESS) {
        close();
        return Outcome::Failed;
    }
    return finishConnect();
}

void ClientSocket::waitUntilConnected(int milliseconds) const
{
    using Clock = std::chrono::steady_clock;
    const auto deadline = Clock::now() + std::chrono::milliseconds(milliseconds);
    pollfd state{m_socket, POLLOUT, 0};
    int result = 0;
    do {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Clock::now()).count();
        result = poll(&state, 1, static_cast<int>(std::max<decltype(left)>(left, 0)));
    } while (result == -1 && errno == EINTR);
}

ClientSocket::Outcome ClientSocket::finishConnect()
{
    pollfd state{m_socket, POLLOUT, 0};
    if (poll(&state, 1, 0) <= 0)
        return Outcome::Pending;
    int error = 0;
    socklen_t size = sizeof error;
    if (getsockopt(m_socket, SOL_SOCKET, SO_ERROR, &error, &size) != 0 || error != 0 ||
        (state.revents & POLLHUP) != 0) {
        close();
        return Outcome::Failed;
    }
    m_state = State::Open;
    return Outcome::Done;
}

bool ClientSocket::peerHasClosed() const
{
    pollfd state{m_socket, POLLRDHUP, 0};
    return poll(&state, 1, 0) != 0;
}

ClientSocket::Outcome ClientSocket::writeFrame(const char* bytes, long used, long& sent)
{
    while (sent < SocketFrame::FRAME_SIZE) {
        const long fromBytes = std::max(used - sent, 0L);
        std::array<iovec, 2> parts = {part(bytes + sent, fromBytes),
                                      part(ZEROS.data(), SocketFrame::FRAME_SIZE - sent - fromBytes)};
        if (fromBytes == 0)
            parts[0] = part(bytes, 0);
        msghdr message{};
        message.msg_iov = parts.data();
        message.msg_iovlen = parts.size();
        const ssize_t count = sendmsg(m_socket, &message, MSG_NOSIGNAL | MSG_DONTWAIT);
        if (count > 0)
            sent += count;
        else if (count == -1 && (errno == EAGAIN || errno == EWOULDBLOCK))
            return Outcome::Pending;
        else if (count == 0 || errno != EINTR)
            return Outcome::Failed;
    }
    return Outcome::Done;
}

void ClientSocket::takeAcknowledgements(int most)
{
    std::array<char, SocketFrame::FRAME_SIZE> scratch;
    const auto size = std::min(static_cast<std::size_t>(most), scratch.size());
    [[maybe_unused]] const ssize_t taken = recv(m_socket, scratch.data(), size, MSG_DONTWAIT);
}

bool ClientSocket::waitForRoom()
{
    while (true) {
        pollfd state{m_socket, POLLIN | POLLOUT, 0};
        const int ready = poll(&state, 1, -1);
        if (ready == -1 && errno != EINTR)
            return false;
        if (ready <= 0)
            continue;
        if ((state.revents & POLLIN) != 0) {
            std::array<char, 512> scratch;
            if (recv(m_socket, scratch.data(), scratch.size(), MSG_DONTWAIT) == 0)
                return false; // the peer has closed
        }
        if ((state.revents & (POLLERR | POLLHUP)) != 0)
            return false;
        if ((state.revents & POLLOUT) != 0)
            return true;
    }
}

long ClientSocket::undelivered() const
{
    int bytes = 0;
    return m_state == State::Open && ioctl(m_socket, SIOCOUTQ, &bytes) == 0 ? bytes : 0;
}

void ClientSocket::interrupt()
{
    if (m_socket != -1)
        shutdown(m_socket, SHUT_RDWR);
}

void ClientSocket::close()
{
    if (m_socket != -1) {
        ::close(m_socket);
        m_socket = -1;
    }
    m_state = State::Closed;
}

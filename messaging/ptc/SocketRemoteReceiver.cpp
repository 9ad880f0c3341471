#include "messaging/ptc/SocketRemoteReceiver.h"

#include "messaging/ptc/EventPacket.h"
#include "messaging/ptc/SocketFrame.h"
#include "messaging/ptc/WorkerSignals.h"

#include <boost/thread.hpp>

#include <netinet/in.h>
#include <netinet/tcp.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <new>

namespace
{

const int LISTEN_BACKLOG = 10;

void printLine(const char* text)
{
    std::puts(text);
    std::fflush(stdout);
}

long readLong(const char* frame, long offset)
{
    std::int64_t value = 0;
    std::memcpy(&value, frame + offset, sizeof value);
    return value;
}

} // namespace

SocketRemoteReceiver::SocketRemoteReceiver(long id) : PTC::RemoteReceiver(id)
{
}

SocketRemoteReceiver::~SocketRemoteReceiver()
{
    m_stopping = true;
    stopReceivers();
    const int listenSocket = m_listenSocket.exchange(-1);
    if (listenSocket != -1)
        shutdown(listenSocket, SHUT_RDWR); // wakes up accept
    if (m_acceptThread != nullptr) {
        m_acceptThread->interrupt();
        m_acceptThread->join();
    }
    {
        const std::lock_guard<std::mutex> lock(m_connectionMutex);
        for (const Connection& connection : m_connections)
            if (!connection.ended)
                shutdown(connection.socket, SHUT_RDWR);
    }
    for (const Connection& connection : m_connections)
        connection.thread->join();
    for (const int socket : m_endedSockets)
        close(socket);
    if (listenSocket != -1)
        close(listenSocket);
}

bool SocketRemoteReceiver::initialize(long identity)
{
    if (m_listenSocket != -1)
        return false;
    PTC::RemoteReceiver::initialize(identity);
    if (!prepareListeningSocket())
        return false;
    try {
        m_acceptThread = std::make_unique<boost::thread>(&SocketRemoteReceiver::connectListeners, this);
    } catch (const boost::thread_resource_error&) {
        return failStart("[Error]create socket server listenner failed!");
    }
    return true;
}

bool SocketRemoteReceiver::prepareListeningSocket()
{
    m_listenSocket = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, IPPROTO_TCP);
    if (m_listenSocket == -1) {
        printLine("[Error]Socket Server create failed!");
        return false;
    }
    const int on = 1;
    if (setsockopt(m_listenSocket, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on) != 0)
        return failStart("[Error]Socket Server reuse address failed!");
    const int bufferSize = SocketFrame::RECEIVE_BUFFER_SIZE;
    if (setsockopt(m_listenSocket, SOL_SOCKET, SO_RCVBUF, &bufferSize, sizeof bufferSize) != 0)
        return failStart("[Error]Socket Server set Rec buffer failed!");
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(SocketFrame::portOf(getIdentity()));
    if (address.sin_port == 0 ||
        ::bind(m_listenSocket, reinterpret_cast<sockaddr*>(&address), sizeof address) != 0)
        return failStart("[Error]Socket Server create failed!");
    if (listen(m_listenSocket, LISTEN_BACKLOG) != 0)
        return failStart("[Error]create socket server listenner failed!");
    return true;
}

bool SocketRemoteReceiver::failStart(const char* message)
{
    printLine(message);
    close(m_listenSocket.exchange(-1));
    return false;
}

void SocketRemoteReceiver::run()
{
}

void SocketRemoteReceiver::connectListeners(void* receiver)
{
    WorkerSignals::leaveToMainThread();
    try {
        static_cast<SocketRemoteReceiver*>(receiver)->waitClientLink();
    } catch (const boost::thread_interrupted&) {
        return; // the destructor has interrupted this thread
    }
}

void SocketRemoteReceiver::waitClientLink()
{
    const int listenSocket = m_listenSocket;
    while (!m_stopping) {
        if (!hasRoomForOneMore()) {
            pauseAccepting();
            continue;
        }
        const int client = accept4(listenSocket, nullptr, nullptr, SOCK_CLOEXEC);
        if (m_stopping) {
            if (client != -1)
                close(client);
            return;
        }
        if (client == -1) {
            printLine("[Error]bad client!");
            if (errno != ECONNABORTED && errno != EINTR) {
                // Out of descriptors or memory: the connection stays pending, and an immediate retry would
                // only spin.
                pauseAccepting();
            }
            continue;
        }
        addClientThread(client);
        pauseAccepting();
    }
}

void SocketRemoteReceiver::pauseAccepting() const
{
    boost::this_thread::sleep(boost::posix_time::milliseconds(m_acceptPauseMs));
}

bool SocketRemoteReceiver::hasRoomForOneMore()
{
    joinEndedThreads();
    return m_connections.size() < MAX_OPEN_CONNECTIONS;
}

void SocketRemoteReceiver::addClientThread(int socket)
{
    const int on = 1;
    setsockopt(socket, IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
    m_lastClientSocket = socket;
    const std::lock_guard<std::mutex> lock(m_connectionMutex);
    Connection& connection = m_connections.emplace_back();
    connection.receiver = this;
    connection.socket = socket;
    try {
        connection.thread = std::make_unique<boost::thread>(&SocketRemoteReceiver::ThreadEntry, &connection);
    } catch (const boost::thread_resource_error&) {
        printLine("[Error]bad client!");
        m_connections.pop_back();
        close(socket);
    }
}

void SocketRemoteReceiver::joinEndedThreads()
{
    const boost::this_thread::disable_interruption toTheEnd;
    const std::lock_guard<std::mutex> lock(m_connectionMutex);
    std::erase_if(m_connections, [](const Connection& connection) {
        if (connection.ended)
            connection.thread->join();
        return connection.ended;
    });
}

void SocketRemoteReceiver::ThreadEntry(void* start)
{
    WorkerSignals::leaveToMainThread();
    auto* connection = static_cast<Connection*>(start);
    connection->receiver->ThreadMain(connection->socket);
    connection->receiver->keepEndedSocket(*connection);
}

// The last call of a connection's thread.
void SocketRemoteReceiver::keepEndedSocket(Connection& connection)
{
    const std::lock_guard<std::mutex> lock(m_connectionMutex);
    m_endedSockets.push_back(connection.socket);
    if (m_endedSockets.size() > MAX_ENDED_CONNECTIONS) {
        close(m_endedSockets.front());
        m_endedSockets.pop_front();
    }
    connection.ended = true;
}

int SocketRemoteReceiver::ThreadMain(int socket)
{
    const std::unique_ptr<char[]> buffer(new (std::nothrow) char[SocketFrame::FRAME_SIZE]());
    if (buffer == nullptr)
        return -1;
    long got = 0;
    long want = SocketFrame::FRAME_SIZE;
    while (true) {
        const int received =
            static_cast<int>(recv(socket, buffer.get() + got, static_cast<std::size_t>(want), 0));
        if (received == -1 && errno == EINTR)
            continue;
        if (isRecvDataFailed(received))
            return 0;
        if (!sendACK(socket)) {
            want = SocketFrame::FRAME_SIZE - got; // the next read overwrites these bytes
            continue;
        }
        got += received;
        if (got < SocketFrame::FRAME_SIZE) {
            want = SocketFrame::FRAME_SIZE - got;
            continue;
        }
        got = 0;
        want = SocketFrame::FRAME_SIZE;
        executePacket(buffer.get());
    }
}

void SocketRemoteReceiver::executePacket(char* frame)
{
    PTC::EventPacket packet;
    packet.receiverId = readLong(frame, SocketFrame::RECEIVER_ID);
    packet.objectId = readLong(frame, SocketFrame::OBJECT_ID);
    packet.methodId = readLong(frame, SocketFrame::METHOD_ID);
    packet.callback = frame[SocketFrame::IS_CALLBACK] != 0;
    packet.size = readLong(frame, SocketFrame::SIZE);
    packet.remote = frame[SocketFrame::IS_REMOTE] != 0;
    if (packet.size <= 0 || packet.size > SocketFrame::MAX_PAYLOAD)
        return;
    const auto size = static_cast<std::size_t>(packet.size);
    char* data = new char[size];
    std::memcpy(data, frame + SocketFrame::HEADER_SIZE, size);
    packet.data = data;
    handleEventPacket(&packet);
}

bool SocketRemoteReceiver::sendACK(int socket)
{
    ssize_t sent = 0;
    do {
        sent = ::send(socket, SocketFrame::ACKNOWLEDGEMENT.data(), SocketFrame::ACKNOWLEDGEMENT.size(),
                      MSG_NOSIGNAL);
    } while (sent == -1 && errno == EINTR);
    return sent != 0 && sent != -1;
}

bool SocketRemoteReceiver::isRecvDataFailed(int received)
{
    return received == -1 || received == 0;
}

int SocketRemoteReceiver::getLastClientSocket() const
{
    return m_lastClientSocket;
}

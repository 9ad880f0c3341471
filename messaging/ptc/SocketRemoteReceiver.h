#pragma once

#include "messaging/ptc/RemoteReceiver.h"

#include <atomic>
#include <deque>
#include <list>
#include <memory>
#include <mutex>

namespace boost
{
class thread;
}

// Listens on 127.0.0.1 and converts the frames of every connection to event packets.
//
// One thread accepts connections, and one thread per connection reads frames and calls handleEventPacket.
// Errors at start are printed to standard output. The sockets of ended connections are kept open for a while.
// The limits below bound the numbers of open and of ended connections: beyond them, new connections wait to
// be accepted, and the oldest kept socket is closed.
class SocketRemoteReceiver : public PTC::RemoteReceiver
{
public:
    static constexpr int MAX_OPEN_CONNECTIONS = 64;
    static constexpr int MAX_ENDED_CONNECTIONS = 64;
    static constexpr int ACCEPT_PAUSE_MS = 500;

    explicit SocketRemoteReceiver(long id);
    // Closes all sockets and waits for the threads.
    ~SocketRemoteReceiver() override;

    // Sets the pause between two accepted connections in milliseconds. Call before initialize.
    void setAcceptPause(int milliseconds) { m_acceptPauseMs = milliseconds; }
    // Listens on the port of that client number. If a step fails, closes the socket and returns false.
    bool initialize(long identity) override;
    void run() override;

    // Dispatches one whole frame. Ignores frames whose payload size is not positive or exceeds the frame.
    void executePacket(char* frame);
    // Sends the acknowledgement. Returns false if the connection no longer accepts it.
    bool sendACK(int socket);
    // Reads one connection until it ends. Returns -1 if memory is short, else 0.
    int ThreadMain(int socket);
    static void ThreadEntry(void* start);
    void addClientThread(int socket);
    void waitClientLink();
    static void connectListeners(void* receiver);
    // Returns whether a result of recv ends the connection.
    static bool isRecvDataFailed(int received);
    // Returns the socket of the newest connection, or -1 before the first.
    int getLastClientSocket() const;

private:
    struct Connection {
        SocketRemoteReceiver* receiver = nullptr;
        int socket = -1;
        std::unique_ptr<boost::thread> thread;
        bool ended = false; // the socket is in m_endedSockets
    };

    bool prepareListeningSocket();
    bool failStart(const char* message);
    void pauseAccepting() const;
    bool hasRoomForOneMore();
    void joinEndedThreads();
    void keepEndedSocket(Connection& connection);

    int m_acceptPauseMs = ACCEPT_PAUSE_MS;
    std::atomic<int> m_listenSocket{-1};
    std::atomic<int> m_lastClientSocket{-1};
    std::atomic<bool> m_stopping{false};
    std::unique_ptr<boost::thread> m_acceptThread;

    std::mutex m_connectionMutex;
    std::list<Connection>
        m_connections; // changed by the accept thread and, after that has ended, by the destructor
    std::deque<int> m_endedSockets; // oldest first
};

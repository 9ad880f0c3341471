// Listens on 127.0.0.1 and turns the frames of every connection into event packets.
//
// One thread accepts, and one thread for each connection reads; handleEventPacket is called in the latter.
// Errors at start are printed to standard output. Of connections that are open and of those that have ended,
// whose sockets are kept, there are never more than the limits below: further connections wait to be
// accepted, and the socket that was kept longest is closed.
#pragma once

#include "messaging/ptc/RemoteReceiver.h"

#include <boost/thread.hpp>

#include <atomic>
#include <deque>
#include <list>
#include <memory>
#include <mutex>

class SocketRemoteReceiver : public PTC::RemoteReceiver
{
public:
    static constexpr int MAX_OPEN_CONNECTIONS = 64;
    static constexpr int MAX_ENDED_CONNECTIONS = 64;
    static constexpr int ACCEPT_PAUSE_MS = 500;

    explicit SocketRemoteReceiver(long id);
    // Closes all sockets and waits for the threads.
    ~SocketRemoteReceiver() override;

    // Milliseconds between one connection and the next; before initialize.
    void setAcceptPause(int milliseconds) { m_acceptPauseMs = milliseconds; }
    // Listens on the port of that client number. False when any step fails, with the socket closed.
    bool initialize(long identity) override;
    void run() override;

    // Dispatches one whole frame. A payload size of 0 or less, or above the frame's room, dispatches nothing.
    void executePacket(char* frame);
    // Sends the acknowledgement; false when the connection no longer takes it.
    bool sendACK(int socket);
    // Reads one connection until it ends. -1 when there is no memory, else 0.
    int ThreadMain(int socket);
    static void ThreadEntry(void* start);
    void addClientThread(int socket);
    void waitClientLink();
    static void connectListeners(void* receiver);
    // Whether a result of recv ends the connection.
    static bool isRecvDataFailed(int received);
    // The socket of the newest connection, -1 before the first.
    int getLastClientSocket() const;

private:
    struct Connection {
        SocketRemoteReceiver* receiver = nullptr;
        int socket = -1;
        std::unique_ptr<boost::thread> thread;
        bool ended = false; // the socket is among those that are kept
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
        m_connections;              // changed by the accept thread, and once that has ended by the destructor
    std::deque<int> m_endedSockets; // the one that is kept longest first
};

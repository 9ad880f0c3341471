// Listens on 127.0.0.1 and turns the frames of every connection into event packets.
//
// One thread accepts, and one thread for each connection reads; handleEventPacket is called in the latter.
// Errors at start are printed to standard output.
#pragma once

#include "messaging/ptc/RemoteReceiver.h"

#include <boost/thread.hpp>

#include <atomic>
#include <memory>
#include <vector>

class SocketRemoteReceiver : public PTC::RemoteReceiver
{
public:
    explicit SocketRemoteReceiver(long id);
    // Closes all sockets and waits for the threads.
    ~SocketRemoteReceiver() override;

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
    struct ClientStart;
    struct ClientThread {
        std::unique_ptr<boost::thread> thread;
        std::shared_ptr<std::atomic<bool>> finished;
    };

    bool prepareListeningSocket();
    void joinFinishedThreads();
    bool failStart(const char* message);

    std::atomic<int> m_listenSocket{-1};
    std::atomic<int> m_lastClientSocket{-1};
    std::atomic<bool> m_stopping{false};
    std::unique_ptr<boost::thread> m_acceptThread;
    std::vector<int> m_clientSockets;          // accept thread, and the destructor once that has ended
    std::vector<ClientThread> m_clientThreads; // the same
};

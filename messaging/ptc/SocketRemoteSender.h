#pragma once

#include "messaging/ptc/ClientSocket.h"
#include "messaging/ptc/RemoteSender.h"
#include "messaging/ptc/SocketFrame.h"

#include <array>
#include <condition_variable>
#include <deque>
#include <mutex>
#include <thread>
#include <vector>

namespace PTC
{
class Event;
}

// Sends events to the process that listens on the port of a client number, in order and without blocking the
// caller: a frame that the socket accepts at once is sent in the calling thread; others are queued and sent
// by a worker thread, which runs only while frames are queued.
//
// If the connection is lost, the next call begins a new one, so that a restarted process is reached again.
// Frames that cannot be delivered are dropped, with one line in the debug log until calls succeed again:
// - all queued frames, if the process does not listen or does not accept within CONNECT_TIMEOUT_MS;
// - the oldest of more than MAX_WAITING_FRAMES, if the process does not read.
//
// Any thread may call; concurrent calls are sent in any order.
class SocketRemoteSender : public PTC::RemoteSender
{
public:
    static constexpr int CONNECT_TIMEOUT_MS = 2000;
    static constexpr int MAX_WAITING_FRAMES = 256;
    // Time that the destructor waits for queued frames, unless finish was called before.
    static constexpr int FINISH_TIMEOUT_MS = 1000;

    // id is the receiver id that every frame of this sender carries.
    explicit SocketRemoteSender(long id);
    ~SocketRemoteSender() override;
    SocketRemoteSender(const SocketRemoteSender&) = delete;
    SocketRemoteSender& operator=(const SocketRemoteSender&) = delete;

    // Waits for the connection, at most the connect timeout, and returns whether it is established. May be
    // called again.
    bool initialize(long identity) override;
    // Returns 0 on success, -1 otherwise.
    int connectServer();
    bool beginConnect(long identity) override;
    // Sets how long to wait, in milliseconds, for a listener whose queue is full.
    void setConnectTimeout(int milliseconds);

    // Deletes the event. Drops payloads of more than 20,424 bytes.
    void send(PTC::Event* event) override;
    // Returns whether the connection is established and the peer has not closed it.
    bool isConnected() const override;
    // As isConnected, but begins a new connection if there is none.
    bool reconnect() override;
    void finish(std::chrono::steady_clock::time_point deadline) override;

private:
    enum class Loss { NotReached, NotRead };
    using Lock = std::unique_lock<std::mutex>;

    unsigned short port();
    ClientSocket::Outcome ensureConnection();
    long packFrame(const PTC::Event& event);
    ClientSocket::Outcome sendAtOnce(long used, long& sent);
    void keep(Lock& lock, long used, long sent);
    void lose(Lock& lock, Loss loss);
    void loseWaiting(Lock& lock);
    void startWork();
    void stopWork(Lock& lock);
    void work();
    void completeConnection(Lock& lock);
    void sendNextWaiting(Lock& lock);
    void waitUntilDelivered(std::chrono::steady_clock::time_point deadline);

    mutable std::mutex m_mutex; // guards all members below
    ClientSocket m_socket;
    int m_connectTimeoutMs = CONNECT_TIMEOUT_MS;
    std::array<char, SocketFrame::FRAME_SIZE> m_frame{};
    std::deque<std::vector<char>> m_waiting; // without the zero padding
    long m_firstSent = 0;                    // bytes sent of the first waiting frame
    bool m_firstWasBegunAnew = false;        // the first waiting frame has had its second connection
    bool m_isLosing = false;                 // calls are being lost, and this was logged
    bool m_isWorking = false;
    bool m_isAbandoned = false;
    bool m_isFinished = false;
    std::condition_variable m_workEnded;
    std::thread m_worker;
};

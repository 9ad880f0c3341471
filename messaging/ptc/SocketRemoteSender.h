// Sends events to the process that listens on the port of a client number, in their order and without ever
// holding up the caller: a frame that the socket takes goes out in the calling thread, others wait for a
// thread that works while something waits.
//
// A lost connection is begun anew by the next call, so that a process that was started anew is reached again.
// What cannot be delivered is dropped, frame by frame, with one line in the debug log until calls go through
// again:
// - to a process that does not listen, or does not accept within CONNECT_TIMEOUT_MS, all that waits;
// - to a process that does not read, the oldest of more than MAX_WAITING_FRAMES.
//
// Any thread may call; the order of the calls of several is up to them.
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

class SocketRemoteSender : public PTC::RemoteSender
{
public:
    static constexpr int CONNECT_TIMEOUT_MS = 2000;
    static constexpr int MAX_WAITING_FRAMES = 256;
    // What the destructor spends on frames that wait, unless finish was called before.
    static constexpr int FINISH_TIMEOUT_MS = 1000;

    // id is the receiver id that every frame of this sender carries.
    explicit SocketRemoteSender(long id);
    ~SocketRemoteSender() override;
    SocketRemoteSender(const SocketRemoteSender&) = delete;
    SocketRemoteSender& operator=(const SocketRemoteSender&) = delete;

    // Waits for the connection, at most the connect timeout. True when it stands. May be called again.
    bool initialize(long identity) override;
    // 0 on success, -1 otherwise.
    int connectServer();
    bool beginConnect(long identity) override;
    // Milliseconds that a listener without room is waited for.
    void setConnectTimeout(int milliseconds);

    // Deletes the event. A payload above 20,424 bytes is dropped.
    void send(PTC::Event* event) override;
    // Whether the connection stands and the peer has not closed it.
    bool isConnected() const override;
    // The same; a connection that does not stand is begun anew.
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

    mutable std::mutex m_mutex; // of all that follows
    ClientSocket m_socket;
    int m_connectTimeoutMs = CONNECT_TIMEOUT_MS;
    std::array<char, SocketFrame::FRAME_SIZE> m_frame{};
    std::deque<std::vector<char>> m_waiting; // frames without their zeros at the end
    long m_firstSent = 0;                    // bytes of the first one that waits
    bool m_firstWasBegunAnew = false;        // on a second connection
    bool m_isLosing = false;                 // and the log says so
    bool m_isWorking = false;
    bool m_isAbandoned = false;
    bool m_isFinished = false;
    std::condition_variable m_workEnded;
    std::thread m_worker;
};

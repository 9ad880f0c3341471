#include "messaging/ptc/SocketRemoteSender.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/WorkerSignals.h"
#include "support/LogManager.h"

#include <chrono>
#include <cstdint>
#include <cstring>
#include <memory>
#include <string>
#include <system_error>
#include <utility>

using Outcome = ClientSocket::Outcome;

namespace
{

constexpr int DRAIN_SIZE = 10;
// Time to wait for a refusal. On the loopback address it normally comes at once, but not on a busy machine.
constexpr int REFUSAL_MS = 20;
constexpr std::chrono::milliseconds DELIVERY_POLL(5);
constexpr int LOG_NUMBER = 200;

} // namespace

SocketRemoteSender::SocketRemoteSender(long id) : PTC::RemoteSender(id)
{
}

SocketRemoteSender::~SocketRemoteSender()
{
    SocketRemoteSender::finish(std::chrono::steady_clock::now() +
                               std::chrono::milliseconds(FINISH_TIMEOUT_MS));
}

void SocketRemoteSender::setConnectTimeout(int milliseconds)
{
    const Lock lock(m_mutex);
    m_connectTimeoutMs = milliseconds;
}

unsigned short SocketRemoteSender::port()
{
    return SocketFrame::portOf(getIdentity());
}

bool SocketRemoteSender::initialize(long identity)
{
    {
        Lock lock(m_mutex);
        stopWork(lock);
        PTC::RemoteSender::initialize(identity);
    }
    return connectServer() == 0;
}

int SocketRemoteSender::connectServer()
{
    Lock lock(m_mutex);
    stopWork(lock);
    m_waiting.clear();
    Outcome outcome = m_socket.beginConnect(port());
    if (outcome == Outcome::Pending) {
        m_socket.waitUntilConnected(m_connectTimeoutMs);
        outcome = m_socket.finishConnect();
    }
    if (outcome != Outcome::Done) {
        m_socket.close();
        return -1;
    }
    return 0;
}

bool SocketRemoteSender::beginConnect(long identity)
{
    Lock lock(m_mutex);
    if (getIdentity() != identity) {
        stopWork(lock);
        m_waiting.clear();
        m_socket.close();
        PTC::RemoteSender::initialize(identity);
    }
    if (m_isWorking)
        return true;
    Outcome outcome = ensureConnection();
    if (outcome == Outcome::Pending) {
        m_socket.waitUntilConnected(REFUSAL_MS);
        outcome = m_socket.finishConnect();
    }
    if (outcome == Outcome::Pending)
        startWork();
    return outcome != Outcome::Failed;
}

// Returns Done if the connection is established, otherwise the result of beginning a new one.
Outcome SocketRemoteSender::ensureConnection()
{
    if (m_socket.isOpen() && !m_socket.peerHasClosed())
        return Outcome::Done;
    return m_socket.beginConnect(port());
}

void SocketRemoteSender::send(PTC::Event* event)
{
    const std::unique_ptr<PTC::Event> owner(event);
    if (event == nullptr || event->getSize() < 0 || event->getSize() > SocketFrame::MAX_PAYLOAD)
        return;
    Lock lock(m_mutex);
    if (m_isFinished || getIdentity() == -1)
        return;
    const long used = packFrame(*event);
    long sent = 0;
    switch (m_isWorking ? Outcome::Pending : sendAtOnce(used, sent)) {
    case Outcome::Done:
        m_isLosing = false;
        break;
    case Outcome::Pending:
        keep(lock, used, sent);
        break;
    case Outcome::Failed:
        lose(lock, Loss::NotReached);
        break;
    }
}

long SocketRemoteSender::packFrame(const PTC::Event& event)
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
    return SocketFrame::HEADER_SIZE + size;
}

// A peer that was restarted is reached by a second connection, on which the whole frame is sent again.
Outcome SocketRemoteSender::sendAtOnce(long used, long& sent)
{
    for (int connection = 0; connection < 2; ++connection) {
        const Outcome connected = ensureConnection();
        if (connected != Outcome::Done)
            return connected;
        m_socket.takeAcknowledgements(DRAIN_SIZE);
        const Outcome outcome = m_socket.writeFrame(m_frame.data(), used, sent);
        if (outcome != Outcome::Failed)
            return outcome;
        m_socket.close();
        sent = 0;
    }
    return Outcome::Failed;
}

// If too many frames wait, the oldest are dropped: the newest calls report the current state.
void SocketRemoteSender::keep(Lock& lock, long used, long sent)
{
    if (m_waiting.empty()) {
        m_firstSent = sent;
        m_firstWasBegunAnew = false;
    }
    m_waiting.emplace_back(m_frame.begin(), m_frame.begin() + used);
    startWork();
    if (m_waiting.size() > MAX_WAITING_FRAMES) {
        m_waiting.erase(m_firstSent > 0 ? m_waiting.begin() + 1 : m_waiting.begin());
        lose(lock, m_socket.isOpen() ? Loss::NotRead : Loss::NotReached);
    }
}

// Logs once that calls are lost. The lock is released meanwhile.
void SocketRemoteSender::lose(Lock& lock, Loss loss)
{
    if (m_isLosing)
        return;
    m_isLosing = true;
    const std::wstring peer = L"port " + std::to_wstring(port());
    lock.unlock();
    LOG_DEBUG_OPERATE(L"SocketRemoteSender", LOG_NUMBER,
                      loss == Loss::NotRead ? L"The process at " + peer + L" does not read: calls are lost"
                                            : L"Nobody is reached at " + peer + L": calls are lost");
    lock.lock();
}

void SocketRemoteSender::loseWaiting(Lock& lock)
{
    m_socket.close();
    if (m_waiting.empty())
        return;
    m_waiting.clear();
    m_firstSent = 0;
    lose(lock, Loss::NotReached);
}

bool SocketRemoteSender::isConnected() const
{
    const Lock lock(m_mutex);
    return m_socket.isOpen() && !m_socket.peerHasClosed();
}

bool SocketRemoteSender::reconnect()
{
    Lock lock(m_mutex);
    if (m_isWorking)
        return m_socket.isOpen();
    if (getIdentity() == -1 || m_isFinished)
        return false;
    const Outcome outcome = ensureConnection();
    if (outcome == Outcome::Pending)
        startWork();
    return outcome == Outcome::Done;
}

// --- The worker thread ------------------------------------------------------------------------------

void SocketRemoteSender::startWork()
{
    if (m_isWorking)
        return;
    if (m_worker.joinable())
        m_worker.join(); // it no longer takes the lock
    try {
        m_worker = std::thread(&SocketRemoteSender::work, this);
        m_isWorking = true;
    } catch (const std::system_error&) {
        m_socket.close(); // a frame may be partly sent: the peer would misread all that follows
        m_waiting.clear();
    }
}

// Afterwards the thread has ended and the waiting frames can be accessed without the lock.
void SocketRemoteSender::stopWork(Lock& lock)
{
    if (m_isWorking) {
        m_isAbandoned = true;
        m_socket.interrupt();
        m_workEnded.wait(lock, [this] { return !m_isWorking; });
        m_isAbandoned = false;
        m_socket.close();
    }
    if (m_worker.joinable())
        m_worker.join();
}

void SocketRemoteSender::work()
{
    WorkerSignals::leaveToMainThread();
    Lock lock(m_mutex);
    while (!m_isAbandoned && (m_socket.isConnecting() || !m_waiting.empty()))
        if (m_socket.isConnecting())
            completeConnection(lock);
        else
            sendNextWaiting(lock);
    m_isWorking = false;
    m_workEnded.notify_all();
}

void SocketRemoteSender::completeConnection(Lock& lock)
{
    const int timeout = m_connectTimeoutMs;
    lock.unlock();
    m_socket.waitUntilConnected(timeout);
    lock.lock();
    if (m_isAbandoned || m_socket.finishConnect() == Outcome::Done)
        return;
    loseWaiting(lock);
}

void SocketRemoteSender::sendNextWaiting(Lock& lock)
{
    if (!m_socket.isOpen()) {
        // Only one new connection per frame, so that a peer that closes every connection is not retried for
        // ever.
        m_firstSent = 0;
        if (std::exchange(m_firstWasBegunAnew, true) || m_socket.beginConnect(port()) == Outcome::Failed)
            loseWaiting(lock);
        return;
    }
    const std::vector<char>& frame = m_waiting.front();
    switch (m_socket.writeFrame(frame.data(), static_cast<long>(frame.size()), m_firstSent)) {
    case Outcome::Done:
        m_waiting.pop_front();
        m_firstSent = 0;
        m_firstWasBegunAnew = false;
        if (m_waiting.empty())
            m_isLosing = false;
        break;
    case Outcome::Pending: {
        lock.unlock();
        const bool hasRoom = m_socket.waitForRoom();
        lock.lock();
        if (!hasRoom)
            m_socket.close();
        break;
    }
    case Outcome::Failed:
        m_socket.close();
        break;
    }
}

void SocketRemoteSender::finish(std::chrono::steady_clock::time_point deadline)
{
    Lock lock(m_mutex);
    if (m_isFinished)
        return;
    m_isFinished = true;
    m_workEnded.wait_until(lock, deadline, [this] { return !m_isWorking; });
    if (!m_isWorking)
        waitUntilDelivered(deadline);
    stopWork(lock);
    m_socket.close();
}

// Closing a socket with unread acknowledgements resets the connection and discards what has not arrived yet.
void SocketRemoteSender::waitUntilDelivered(std::chrono::steady_clock::time_point deadline)
{
    while (m_socket.undelivered() > 0 && !m_socket.peerHasClosed()) {
        if (std::chrono::steady_clock::now() >= deadline) {
            m_socket.takeAcknowledgements(SocketFrame::FRAME_SIZE);
            return;
        }
        std::this_thread::sleep_for(DELIVERY_POLL);
    }
}

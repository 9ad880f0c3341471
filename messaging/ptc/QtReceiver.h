// A receiver whose adapters live in the thread of its QObject, whatever thread an event comes from.
#pragma once

#include "messaging/ptc/Receiver.h"

#include <QObject>

#include <condition_variable>
#include <mutex>

namespace PTC
{

class QtReceiver : public QObject, public Receiver
{
    Q_OBJECT

public:
    // Events that may wait for the receiving thread at one time; a sender of more is held up.
    static constexpr int MAX_PENDING_EVENTS = 256;

    explicit QtReceiver(long id);
    ~QtReceiver() override;

    // Posts the event to the receiver's thread. While MAX_PENDING_EVENTS wait there, another thread is held
    // up here; the receiver's own thread is not.
    void recv(Event* event) override;
    void stopReceiving() override;
    // Events that wait for the receiving thread. Any thread.
    int pendingEvents();

protected:
    void customEvent(QEvent* event) override;

private:
    void oneEventLess();

    std::mutex m_mutex;
    std::condition_variable m_roomForMore;
    int m_pendingEvents = 0;
    bool m_stopped = false;
};

} // namespace PTC

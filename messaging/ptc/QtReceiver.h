#pragma once

#include "messaging/ptc/Receiver.h"

#include <QObject>

#include <condition_variable>
#include <mutex>

namespace PTC
{

// A receiver that calls its adapters in the thread of its QObject, whatever thread an event comes from.
class QtReceiver : public QObject, public Receiver
{
    Q_OBJECT

public:
    // Largest number of events that wait for the receiving thread; further senders are blocked.
    static constexpr int MAX_PENDING_EVENTS = 256;

    explicit QtReceiver(long id);
    ~QtReceiver() override;

    // Posts the event to the receiver's thread. While MAX_PENDING_EVENTS are waiting, blocks the calling
    // thread unless it is the receiver's own.
    void recv(Event* event) override;
    void stopReceiving() override;
    // Returns the number of events that wait for the receiving thread. Any thread.
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

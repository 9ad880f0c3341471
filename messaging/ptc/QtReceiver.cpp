#include "messaging/ptc/QtReceiver.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/QtReceiverEvent.h"

#include <QCoreApplication>
#include <QThread>

namespace PTC
{

QtReceiver::QtReceiver(long id) : Receiver(id)
{
}

QtReceiver::~QtReceiver() = default;

void QtReceiver::recv(Event* event)
{
    auto posted = std::make_unique<QtReceiverEvent>(event);
    {
        std::unique_lock<std::mutex> lock(m_mutex);
        if (QThread::currentThread() != thread())
            m_roomForMore.wait(lock, [this] { return m_stopped || m_pendingEvents < MAX_PENDING_EVENTS; });
        if (m_stopped)
            return;
        ++m_pendingEvents;
    }
    QCoreApplication::postEvent(this, posted.release());
}

void QtReceiver::stopReceiving()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    m_stopped = true;
    m_roomForMore.notify_all();
}

int QtReceiver::pendingEvents()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return m_pendingEvents;
}

void QtReceiver::customEvent(QEvent* event)
{
    if (event->type() != static_cast<QEvent::Type>(QtReceiverEvent::TYPE))
        return;
    oneEventLess();
    const std::unique_ptr<Event> call(static_cast<QtReceiverEvent*>(event)->takeEvent());
    if (call != nullptr) {
        handleEvent(call.get());
        delete[] static_cast<char*>(call->getData());
        call->setData(nullptr);
    }
}

void QtReceiver::oneEventLess()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    --m_pendingEvents;
    m_roomForMore.notify_one();
}

} // namespace PTC

#include "messaging/ptc/QtReceiverEvent.h"

#include "messaging/ptc/Event.h"

#include <utility>

namespace PTC
{

QtReceiverEvent::QtReceiverEvent(Event* event) : QEvent(static_cast<QEvent::Type>(TYPE)), m_event(event)
{
}

QtReceiverEvent::~QtReceiverEvent()
{
    if (m_event != nullptr) {
        delete[] static_cast<char*>(m_event->getData());
        delete m_event;
    }
}

Event* QtReceiverEvent::takeEvent()
{
    return std::exchange(m_event, nullptr);
}

} // namespace PTC

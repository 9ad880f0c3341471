#include "messaging/ptc/EventQueue.h"

#include "messaging/ptc/Event.h"

namespace PTC
{

EventQueue::~EventQueue()
{
    for (Event* event : m_events)
        delete event;
}

void EventQueue::add(Event* event)
{
    m_events.push_back(event);
}

Event* EventQueue::at(unsigned long index) const
{
    return index < m_events.size() ? m_events[index] : nullptr;
}

void EventQueue::remove(unsigned long index)
{
    if (index >= m_events.size())
        return;
    delete m_events[index];
    m_events.erase(m_events.begin() + static_cast<std::ptrdiff_t>(index));
}

unsigned long EventQueue::count() const
{
    return m_events.size();
}

unsigned long EventQueue::capacity() const
{
    return m_events.capacity();
}

} // namespace PTC

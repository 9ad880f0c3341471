// A list of events that owns them, but not their data.
#pragma once

#include <vector>

namespace PTC
{

class Event;

class EventQueue
{
public:
    EventQueue() = default;
    ~EventQueue();
    EventQueue(const EventQueue&) = delete;
    EventQueue& operator=(const EventQueue&) = delete;

    // Takes the event over.
    void add(Event* event);
    // Null when index is out of range.
    Event* at(unsigned long index) const;
    // Deletes the event; out of range does nothing.
    void remove(unsigned long index);
    unsigned long count() const;
    unsigned long capacity() const;

private:
    std::vector<Event*> m_events;
};

} // namespace PTC

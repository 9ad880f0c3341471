#pragma once

#include <vector>

namespace PTC
{

class Event;

// A list of events. Owns the events, but not their data.
class EventQueue
{
public:
    EventQueue() = default;
    ~EventQueue();
    EventQueue(const EventQueue&) = delete;
    EventQueue& operator=(const EventQueue&) = delete;

    // Takes ownership of the event.
    void add(Event* event);
    // Returns null if index is out of range.
    Event* at(unsigned long index) const;
    // Deletes the event; does nothing if index is out of range.
    void remove(unsigned long index);
    unsigned long count() const;
    unsigned long capacity() const;

private:
    std::vector<Event*> m_events;
};

} // namespace PTC

// Carries one PTC::Event through the Qt event queue.
#pragma once

#include <QEvent>

namespace PTC
{

class Event;

class QtReceiverEvent : public QEvent
{
public:
    static constexpr int TYPE = 65534;

    // Owns the event with its data until takeEvent().
    explicit QtReceiverEvent(Event* event);
    ~QtReceiverEvent() override;

    Event* takeEvent();

private:
    Event* m_event;
};

} // namespace PTC

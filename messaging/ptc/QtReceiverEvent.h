#pragma once

#include <QEvent>

namespace PTC
{

class Event;

// Carries one PTC::Event through the Qt event queue.
class QtReceiverEvent : public QEvent
{
public:
    static constexpr int TYPE = 65534;

    // Takes ownership of the event and its data, until takeEvent().
    explicit QtReceiverEvent(Event* event);
    ~QtReceiverEvent() override;

    Event* takeEvent();

private:
    Event* m_event;
};

} // namespace PTC

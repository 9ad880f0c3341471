#include "messaging/services/PowerManagerNotifyAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/IPowerManagerNotify.h"

PowerManagerNotifyAdapter::PowerManagerNotifyAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void PowerManagerNotifyAdapter::setTarget(void* target)
{
    m_target = static_cast<IPowerManagerNotify*>(target);
}

void PowerManagerNotifyAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_powerOff:
        m_target->powerOff();
        break;
    case METHOD_powerOn:
        m_target->powerOn();
        break;
    default:
        break;
    }
}

#include "messaging/services/PowerManagerCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/IPowerManagerCallBack.h"
#include "messaging/services/PowerManagerParams.h"

PowerManagerCallBackAdapter::PowerManagerCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void PowerManagerCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<IPowerManagerCallBack*>(target);
}

void PowerManagerCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_getClientID: {
        int param = 0;
        PowerManagerParams::deserialize_getClientID_param(param, event->getData(), event->getSize());
        m_target->getClientID(param);
        break;
    }
    default:
        break;
    }
}

#include "messaging/services/APPEventFilterCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/APPEventFilterParams.h"
#include "messaging/services/IAPPEventFilterCallBack.h"

APPEventFilterCallBackAdapter::APPEventFilterCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void APPEventFilterCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<IAPPEventFilterCallBack*>(target);
}

void APPEventFilterCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_setClientID: {
        int param = 0;
        APPEventFilterParams::deserialize_setClientID_param(param, event->getData(), event->getSize());
        m_target->setClientID(param);
        break;
    }
    default:
        break;
    }
}

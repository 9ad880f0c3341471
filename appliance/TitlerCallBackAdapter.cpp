#include "appliance/TitlerCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/ITitlerCallBack.h"
#include "messaging/services/TitlerCallBackRemoteProxy.h"
#include "messaging/services/TitlerParams.h"

TitlerCallBackAdapter::TitlerCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void TitlerCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<ITitlerCallBack*>(target);
}

void TitlerCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr ||
        event->getMethodId() != TitlerCallBackRemoteProxy::METHOD_finishTitlerCreateCallback) {
        return;
    }
    _CALLBACK_TITLER_PARAMTER param;
    TitlerParams::deserialize_finishTitlerCreateCallback_param(param, event->getData(), event->getSize());
    m_target->finishTitlerCreateCallback(param);
}

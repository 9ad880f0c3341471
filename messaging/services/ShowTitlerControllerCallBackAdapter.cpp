#include "messaging/services/ShowTitlerControllerCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/IShowTitlerControllerCallBack.h"

ShowTitlerControllerCallBackAdapter::ShowTitlerControllerCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void ShowTitlerControllerCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<IShowTitlerControllerCallBack*>(target);
}

void ShowTitlerControllerCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_showTitler:
        m_target->showTitler();
        break;
    default:
        break;
    }
}

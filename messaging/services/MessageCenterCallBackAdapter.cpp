#include "messaging/services/MessageCenterCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/IMessageCenterCallBack.h"
#include "messaging/services/MessageCenterParams.h"

MessageCenterCallBackAdapter::MessageCenterCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void MessageCenterCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<IMessageCenterCallBack*>(target);
}

void MessageCenterCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_setClientID: {
        int param = 0;
        MessageCenterParams::deserialize_setClientID_param(param, event->getData(), event->getSize());
        m_target->setClientID(param);
        break;
    }
    case METHOD_getTopWindowCallBack: {
        int param = 0;
        MessageCenterParams::deserialize_getTopWindowCallBack_param(param, event->getData(),
                                                                    event->getSize());
        m_target->getTopWindowCallBack(param);
        break;
    }
    default:
        break;
    }
}

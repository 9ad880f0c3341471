#include "messaging/services/MessageCenterNotifyAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/IMessageCenterNotify.h"
#include "messaging/services/MessageCenterParams.h"

MessageCenterNotifyAdapter::MessageCenterNotifyAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void MessageCenterNotifyAdapter::setTarget(void* target)
{
    m_target = static_cast<IMessageCenterNotify*>(target);
}

void MessageCenterNotifyAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_getTopWindowNotify: {
        int param = 0;
        MessageCenterParams::deserialize_getTopWindowNotify_param(param, event->getData(), event->getSize());
        m_target->getTopWindowNotify(param);
        break;
    }
    case METHOD_postMessageNotify: {
        MessageDefine::_tagMessageParam param{};
        MessageCenterParams::deserialize_postMessageNotify_param(param, event->getData(), event->getSize());
        m_target->postMessageNotify(param);
        break;
    }
    case METHOD_closeMessageNotify: {
        MessageDefine::_tagCloseParam param{};
        MessageCenterParams::deserialize_closeMessageNotify_param(param, event->getData(), event->getSize());
        m_target->closeMessageNotify(param);
        break;
    }
    case METHOD_showBarNotify: {
        int param = 0;
        MessageCenterParams::deserialize_showBarNotify_param(param, event->getData(), event->getSize());
        m_target->showBarNotify(param);
        break;
    }
    default:
        break;
    }
}

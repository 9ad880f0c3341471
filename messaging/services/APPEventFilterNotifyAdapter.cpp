#include "messaging/services/APPEventFilterNotifyAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/APPEventFilterParams.h"
#include "messaging/services/IAPPEventFilterNotify.h"

APPEventFilterNotifyAdapter::APPEventFilterNotifyAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void APPEventFilterNotifyAdapter::setTarget(void* target)
{
    m_target = static_cast<IAPPEventFilterNotify*>(target);
}

void APPEventFilterNotifyAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_postAPPEventFilterNotify: {
        APPEventDefine::_tagAPPEvent param{};
        APPEventFilterParams::deserialize_postAPPEventFilterNotify_param(param, event->getData(),
                                                                         event->getSize());
        m_target->postAPPEventFilterNotify(param);
        break;
    }
    case METHOD_postRestoreOriginalNotify: {
        APPEventDefine::_tagAPPEvent param{};
        APPEventFilterParams::deserialize_postRestoreOriginalNotify_param(param, event->getData(),
                                                                          event->getSize());
        m_target->postRestoreOriginalNotify(param);
        break;
    }
    case METHOD_postRestoreFocusNotify:
        m_target->postRestoreFocusNotify();
        break;
    default:
        break;
    }
}

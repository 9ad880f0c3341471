#include "messaging/services/SystemSetupManagerNotifyAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/ISystemSetupManagerNotify.h"
#include "messaging/services/SystemSetupManagerParams.h"

SystemSetupManagerNotifyAdapter::SystemSetupManagerNotifyAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void SystemSetupManagerNotifyAdapter::setTarget(void* target)
{
    m_target = static_cast<ISystemSetupManagerNotify*>(target);
}

void SystemSetupManagerNotifyAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_setSystemLanguageNotify: {
        int param = 0;
        SystemSetupManagerParams::deserialize_setSystemLanguageNotify_param(param, event->getData(),
                                                                            event->getSize());
        m_target->setSystemLanguageNotify(param);
        break;
    }
    case METHOD_setInputLanguageNotify: {
        int param = 0;
        SystemSetupManagerParams::deserialize_setInputLanguageNotify_param(param, event->getData(),
                                                                           event->getSize());
        m_target->setInputLanguageNotify(param);
        break;
    }
    default:
        break;
    }
}

#include "messaging/services/SystemSetupManagerCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/ISystemSetupManagerCallBack.h"
#include "messaging/services/SystemSetupManagerParams.h"

SystemSetupManagerCallBackAdapter::SystemSetupManagerCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void SystemSetupManagerCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<ISystemSetupManagerCallBack*>(target);
}

void SystemSetupManagerCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_getClientID: {
        int param = 0;
        SystemSetupManagerParams::deserialize_getClientID_param(param, event->getData(), event->getSize());
        m_target->getClientID(param);
        break;
    }
    case METHOD_getLanguageInfoCallBack: {
        SystemSetupDef::tagSystemLanguageParam param{};
        SystemSetupManagerParams::deserialize_getLanguageInfoCallBack_param(param, event->getData(),
                                                                            event->getSize());
        m_target->getLanguageInfoCallBack(param);
        break;
    }
    case METHOD_getInformationCallBack: {
        SystemSetupDef::tagSystemInformation param{};
        SystemSetupManagerParams::deserialize_getInformationCallBack_param(param, event->getData(),
                                                                           event->getSize());
        m_target->getInformationCallBack(param);
        break;
    }
    default:
        break;
    }
}

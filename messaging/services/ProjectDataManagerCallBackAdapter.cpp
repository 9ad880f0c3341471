#include "messaging/services/ProjectDataManagerCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/IProjectDataManagerCallBack.h"
#include "messaging/services/ProjectDataManagerParams.h"

ProjectDataManagerCallBackAdapter::ProjectDataManagerCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void ProjectDataManagerCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<IProjectDataManagerCallBack*>(target);
}

void ProjectDataManagerCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_getClientID: {
        int param = 0;
        ProjectDataManagerParams::deserialize_getClientID_param(param, event->getData(), event->getSize());
        m_target->getClientID(param);
        break;
    }
    default:
        break;
    }
}

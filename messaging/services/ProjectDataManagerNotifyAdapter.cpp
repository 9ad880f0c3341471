#include "messaging/services/ProjectDataManagerNotifyAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/IProjectDataManagerNotify.h"
#include "messaging/services/ProjectDataManagerParams.h"

ProjectDataManagerNotifyAdapter::ProjectDataManagerNotifyAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void ProjectDataManagerNotifyAdapter::setTarget(void* target)
{
    m_target = static_cast<IProjectDataManagerNotify*>(target);
}

void ProjectDataManagerNotifyAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_loadNotify: {
        int param = 0;
        ProjectDataManagerParams::deserialize_loadNotify_param(param, event->getData(), event->getSize());
        m_target->loadNotify(param);
        break;
    }
    default:
        break;
    }
}

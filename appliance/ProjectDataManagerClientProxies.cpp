#include "appliance/ProjectDataManagerClientProxies.h"

#include "messaging/services/ProjectDataManagerCallBackAdapter.h"
#include "messaging/services/ProjectDataManagerNotifyAdapter.h"
#include "messaging/services/ProjectDataManagerParams.h"
#include "messaging/services/ServiceCall.h"

ProjectDataManagerCallBackRemoteProxy::ProjectDataManagerCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void ProjectDataManagerCallBackRemoteProxy::getClientID(int clientId)
{
    ServiceCall::invoke(*this, ProjectDataManagerCallBackAdapter::METHOD_getClientID,
                        ProjectDataManagerParams::serialize_getClientID_param(clientId));
}

ProjectDataManagerNotifyRemoteProxy::ProjectDataManagerNotifyRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void ProjectDataManagerNotifyRemoteProxy::loadNotify(int state)
{
    ServiceCall::invoke(*this, ProjectDataManagerNotifyAdapter::METHOD_loadNotify,
                        ProjectDataManagerParams::serialize_loadNotify_param(state));
}

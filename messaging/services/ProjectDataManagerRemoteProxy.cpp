#include "messaging/services/ProjectDataManagerRemoteProxy.h"

#include "messaging/services/IProjectDataManagerCallBack.h"
#include "messaging/services/IProjectDataManagerNotify.h"
#include "messaging/services/ProjectDataManagerParams.h"
#include "messaging/services/ServiceCall.h"

ProjectDataManagerRemoteProxy::ProjectDataManagerRemoteProxy(long id) : PTC::Proxy(static_cast<int>(id), true)
{
}

void ProjectDataManagerRemoteProxy::unregisterCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterCallBack,
                        ProjectDataManagerParams::serialize_unregisterCallBack_param(clientId));
}

void ProjectDataManagerRemoteProxy::unregisterNotifyCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterNotifyCallBack,
                        ProjectDataManagerParams::serialize_unregisterNotifyCallBack_param(clientId));
}

void ProjectDataManagerRemoteProxy::registerCallBack(IProjectDataManagerCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

void ProjectDataManagerRemoteProxy::registerNotifyCallBack(_tagProjectDataManagerNotify notify)
{
    ServiceCall::registerNotify(*this, METHOD_registerNotifyCallBack, NOTIFY_ADAPTER_TYPE, notify.target,
                                notify.clientId);
}

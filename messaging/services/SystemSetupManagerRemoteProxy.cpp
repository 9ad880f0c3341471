#include "messaging/services/SystemSetupManagerRemoteProxy.h"

#include "messaging/services/ISystemSetupManagerCallBack.h"
#include "messaging/services/ISystemSetupManagerNotify.h"
#include "messaging/services/ServiceCall.h"
#include "messaging/services/SystemSetupManagerParams.h"

SystemSetupManagerRemoteProxy::SystemSetupManagerRemoteProxy(long id) : PTC::Proxy(static_cast<int>(id), true)
{
}

void SystemSetupManagerRemoteProxy::getLanguageInfo(int clientId)
{
    ServiceCall::invoke(*this, METHOD_getLanguageInfo,
                        SystemSetupManagerParams::serialize_getLanguageInfo_param(clientId));
}

void SystemSetupManagerRemoteProxy::getInformation(int clientId)
{
    ServiceCall::invoke(*this, METHOD_getInformation,
                        SystemSetupManagerParams::serialize_getInformation_param(clientId));
}

void SystemSetupManagerRemoteProxy::unregisterCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterCallBack,
                        SystemSetupManagerParams::serialize_unregisterCallBack_param(clientId));
}

void SystemSetupManagerRemoteProxy::unregisterNotifyCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterNotifyCallBack,
                        SystemSetupManagerParams::serialize_unregisterNotifyCallBack_param(clientId));
}

void SystemSetupManagerRemoteProxy::registerCallBack(ISystemSetupManagerCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

void SystemSetupManagerRemoteProxy::registerNotifyCallBack(_tagSystemSetupManagerNotify notify)
{
    ServiceCall::registerNotify(*this, METHOD_registerNotifyCallBack, NOTIFY_ADAPTER_TYPE, notify.target,
                                notify.clientId);
}

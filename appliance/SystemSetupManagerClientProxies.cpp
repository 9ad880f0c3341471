#include "appliance/SystemSetupManagerClientProxies.h"

#include "messaging/services/ServiceCall.h"
#include "messaging/services/SystemSetupManagerCallBackAdapter.h"
#include "messaging/services/SystemSetupManagerNotifyAdapter.h"
#include "messaging/services/SystemSetupManagerParams.h"

SystemSetupManagerCallBackRemoteProxy::SystemSetupManagerCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void SystemSetupManagerCallBackRemoteProxy::getClientID(int clientId)
{
    ServiceCall::invoke(*this, SystemSetupManagerCallBackAdapter::METHOD_getClientID,
                        SystemSetupManagerParams::serialize_getClientID_param(clientId));
}

void SystemSetupManagerCallBackRemoteProxy::getLanguageInfoCallBack(
    SystemSetupDef::tagSystemLanguageParam language)
{
    ServiceCall::invoke(*this, SystemSetupManagerCallBackAdapter::METHOD_getLanguageInfoCallBack,
                        SystemSetupManagerParams::serialize_getLanguageInfoCallBack_param(language));
}

void SystemSetupManagerCallBackRemoteProxy::getInformationCallBack(
    SystemSetupDef::tagSystemInformation information)
{
    ServiceCall::invoke(*this, SystemSetupManagerCallBackAdapter::METHOD_getInformationCallBack,
                        SystemSetupManagerParams::serialize_getInformationCallBack_param(information));
}

SystemSetupManagerNotifyRemoteProxy::SystemSetupManagerNotifyRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void SystemSetupManagerNotifyRemoteProxy::setSystemLanguageNotify(int language)
{
    ServiceCall::invoke(*this, SystemSetupManagerNotifyAdapter::METHOD_setSystemLanguageNotify,
                        SystemSetupManagerParams::serialize_setSystemLanguageNotify_param(language));
}

void SystemSetupManagerNotifyRemoteProxy::setInputLanguageNotify(int language)
{
    ServiceCall::invoke(*this, SystemSetupManagerNotifyAdapter::METHOD_setInputLanguageNotify,
                        SystemSetupManagerParams::serialize_setInputLanguageNotify_param(language));
}

#include "messaging/services/PowerManagerRemoteProxy.h"

#include "messaging/services/IPowerManagerCallBack.h"
#include "messaging/services/IPowerManagerNotify.h"
#include "messaging/services/PowerManagerParams.h"
#include "messaging/services/ServiceCall.h"

PowerManagerRemoteProxy::PowerManagerRemoteProxy(long id) : PTC::Proxy(static_cast<int>(id), true)
{
}

void PowerManagerRemoteProxy::closeClient(int clientId)
{
    ServiceCall::invoke(*this, METHOD_closeClient, PowerManagerParams::serialize_closeClient_param(clientId));
}

void PowerManagerRemoteProxy::unregisterCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterCallBack,
                        PowerManagerParams::serialize_unregisterCallBack_param(clientId));
}

void PowerManagerRemoteProxy::unregisterNotify(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterNotify,
                        PowerManagerParams::serialize_unregisterNotify_param(clientId));
}

void PowerManagerRemoteProxy::inProcessing()
{
    ServiceCall::invoke(*this, METHOD_inProcessing);
}

void PowerManagerRemoteProxy::powerOff()
{
    ServiceCall::invoke(*this, METHOD_powerOff);
}

void PowerManagerRemoteProxy::willPowerOff()
{
    ServiceCall::invoke(*this, METHOD_willPowerOff);
}

void PowerManagerRemoteProxy::registerCallBack(IPowerManagerCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

void PowerManagerRemoteProxy::registerNotify(_tagPowerManagerNotify notify)
{
    ServiceCall::registerNotify(*this, METHOD_registerNotify, NOTIFY_ADAPTER_TYPE, notify.target,
                                notify.clientId);
}

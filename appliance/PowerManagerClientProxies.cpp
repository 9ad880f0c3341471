#include "appliance/PowerManagerClientProxies.h"

#include "messaging/services/PowerManagerCallBackAdapter.h"
#include "messaging/services/PowerManagerNotifyAdapter.h"
#include "messaging/services/PowerManagerParams.h"
#include "messaging/services/ServiceCall.h"

PowerManagerCallBackRemoteProxy::PowerManagerCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void PowerManagerCallBackRemoteProxy::getClientID(int clientId)
{
    ServiceCall::invoke(*this, PowerManagerCallBackAdapter::METHOD_getClientID,
                        PowerManagerParams::serialize_getClientID_param(clientId));
}

PowerManagerNotifyRemoteProxy::PowerManagerNotifyRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void PowerManagerNotifyRemoteProxy::powerOff()
{
    ServiceCall::invoke(*this, PowerManagerNotifyAdapter::METHOD_powerOff);
}

void PowerManagerNotifyRemoteProxy::powerOn()
{
    ServiceCall::invoke(*this, PowerManagerNotifyAdapter::METHOD_powerOn);
}

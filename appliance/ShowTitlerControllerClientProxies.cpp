#include "appliance/ShowTitlerControllerClientProxies.h"

#include "messaging/services/ServiceCall.h"
#include "messaging/services/ShowTitlerControllerCallBackAdapter.h"

ShowTitlerControllerCallBackRemoteProxy::ShowTitlerControllerCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void ShowTitlerControllerCallBackRemoteProxy::showTitler()
{
    ServiceCall::invoke(*this, ShowTitlerControllerCallBackAdapter::METHOD_showTitler);
}

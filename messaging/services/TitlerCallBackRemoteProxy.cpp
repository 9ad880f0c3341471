#include "messaging/services/TitlerCallBackRemoteProxy.h"

#include "messaging/services/ServiceCall.h"
#include "messaging/services/TitlerParams.h"

TitlerCallBackRemoteProxy::TitlerCallBackRemoteProxy(long id) : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void TitlerCallBackRemoteProxy::finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param)
{
    ServiceCall::invoke(*this, METHOD_finishTitlerCreateCallback,
                        TitlerParams::serialize_finishTitlerCreateCallback_param(param));
}

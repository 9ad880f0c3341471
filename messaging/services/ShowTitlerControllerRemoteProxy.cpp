#include "messaging/services/ShowTitlerControllerRemoteProxy.h"

#include "messaging/services/IShowTitlerControllerCallBack.h"
#include "messaging/services/ServiceCall.h"
#include "messaging/services/ShowTitlerControllerParams.h"

ShowTitlerControllerRemoteProxy::ShowTitlerControllerRemoteProxy(long id)
    : PTC::Proxy(static_cast<int>(id), true)
{
}

void ShowTitlerControllerRemoteProxy::setFolderStatus(SubCommonDefine::tagFOLDER_TYPE folder)
{
    ServiceCall::invoke(*this, METHOD_setFolderStatus,
                        ShowTitlerControllerParams::serialize_setFolderStatus_param(folder));
}

void ShowTitlerControllerRemoteProxy::registerCallBack(IShowTitlerControllerCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

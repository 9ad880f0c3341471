#include "messaging/services/APPEventFilterRemoteProxy.h"

#include "messaging/services/APPEventFilterParams.h"
#include "messaging/services/IAPPEventFilterCallBack.h"
#include "messaging/services/IAPPEventFilterNotify.h"
#include "messaging/services/ServiceCall.h"

APPEventFilterRemoteProxy::APPEventFilterRemoteProxy(long id) : PTC::Proxy(static_cast<int>(id), true)
{
}

void APPEventFilterRemoteProxy::postAPPEventFilter(APPEventDefine::_tagAPPEvent event)
{
    ServiceCall::invoke(*this, METHOD_postAPPEventFilter,
                        APPEventFilterParams::serialize_postAPPEventFilter_param(event));
}

void APPEventFilterRemoteProxy::postRestoreOriginal(APPEventDefine::_tagAPPEvent event)
{
    ServiceCall::invoke(*this, METHOD_postRestoreOriginal,
                        APPEventFilterParams::serialize_postRestoreOriginal_param(event));
}

void APPEventFilterRemoteProxy::postRestoreFocus()
{
    ServiceCall::invoke(*this, METHOD_postRestoreFocus);
}

void APPEventFilterRemoteProxy::unregisterCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterCallBack,
                        APPEventFilterParams::serialize_unregisterCallBack_param(clientId));
}

void APPEventFilterRemoteProxy::unregisterNotify(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterNotify,
                        APPEventFilterParams::serialize_unregisterNotify_param(clientId));
}

void APPEventFilterRemoteProxy::registerCallBack(IAPPEventFilterCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

void APPEventFilterRemoteProxy::registerNotify(_tagAPPEventFilterNotify notify)
{
    ServiceCall::registerNotify(*this, METHOD_registerNotify, NOTIFY_ADAPTER_TYPE, notify.target,
                                notify.clientId);
}

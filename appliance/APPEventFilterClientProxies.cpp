#include "appliance/APPEventFilterClientProxies.h"

#include "messaging/services/APPEventFilterCallBackAdapter.h"
#include "messaging/services/APPEventFilterNotifyAdapter.h"
#include "messaging/services/APPEventFilterParams.h"
#include "messaging/services/ServiceCall.h"

APPEventFilterCallBackRemoteProxy::APPEventFilterCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void APPEventFilterCallBackRemoteProxy::setClientID(int clientId)
{
    ServiceCall::invoke(*this, APPEventFilterCallBackAdapter::METHOD_setClientID,
                        APPEventFilterParams::serialize_setClientID_param(clientId));
}

APPEventFilterNotifyRemoteProxy::APPEventFilterNotifyRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void APPEventFilterNotifyRemoteProxy::postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent event)
{
    ServiceCall::invoke(*this, APPEventFilterNotifyAdapter::METHOD_postAPPEventFilterNotify,
                        APPEventFilterParams::serialize_postAPPEventFilterNotify_param(event));
}

void APPEventFilterNotifyRemoteProxy::postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent event)
{
    ServiceCall::invoke(*this, APPEventFilterNotifyAdapter::METHOD_postRestoreOriginalNotify,
                        APPEventFilterParams::serialize_postRestoreOriginalNotify_param(event));
}

void APPEventFilterNotifyRemoteProxy::postRestoreFocusNotify()
{
    ServiceCall::invoke(*this, APPEventFilterNotifyAdapter::METHOD_postRestoreFocusNotify);
}

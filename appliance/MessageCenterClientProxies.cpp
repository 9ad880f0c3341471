#include "appliance/MessageCenterClientProxies.h"

#include "messaging/services/MessageCenterCallBackAdapter.h"
#include "messaging/services/MessageCenterNotifyAdapter.h"
#include "messaging/services/MessageCenterParams.h"
#include "messaging/services/ServiceCall.h"

MessageCenterCallBackRemoteProxy::MessageCenterCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void MessageCenterCallBackRemoteProxy::setClientID(int clientId)
{
    ServiceCall::invoke(*this, MessageCenterCallBackAdapter::METHOD_setClientID,
                        MessageCenterParams::serialize_setClientID_param(clientId));
}

void MessageCenterCallBackRemoteProxy::getTopWindowCallBack(int topWindow)
{
    ServiceCall::invoke(*this, MessageCenterCallBackAdapter::METHOD_getTopWindowCallBack,
                        MessageCenterParams::serialize_getTopWindowCallBack_param(topWindow));
}

MessageCenterNotifyRemoteProxy::MessageCenterNotifyRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void MessageCenterNotifyRemoteProxy::getTopWindowNotify(int topWindow)
{
    ServiceCall::invoke(*this, MessageCenterNotifyAdapter::METHOD_getTopWindowNotify,
                        MessageCenterParams::serialize_getTopWindowNotify_param(topWindow));
}

void MessageCenterNotifyRemoteProxy::postMessageNotify(MessageDefine::_tagMessageParam param)
{
    ServiceCall::invoke(*this, MessageCenterNotifyAdapter::METHOD_postMessageNotify,
                        MessageCenterParams::serialize_postMessageNotify_param(param));
}

void MessageCenterNotifyRemoteProxy::closeMessageNotify(MessageDefine::_tagCloseParam param)
{
    ServiceCall::invoke(*this, MessageCenterNotifyAdapter::METHOD_closeMessageNotify,
                        MessageCenterParams::serialize_closeMessageNotify_param(param));
}

void MessageCenterNotifyRemoteProxy::showBarNotify(int bar)
{
    ServiceCall::invoke(*this, MessageCenterNotifyAdapter::METHOD_showBarNotify,
                        MessageCenterParams::serialize_showBarNotify_param(bar));
}

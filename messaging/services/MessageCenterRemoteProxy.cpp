#include "messaging/services/MessageCenterRemoteProxy.h"

#include "messaging/services/IMessageCenterCallBack.h"
#include "messaging/services/IMessageCenterNotify.h"
#include "messaging/services/MessageCenterParams.h"
#include "messaging/services/ServiceCall.h"

MessageCenterRemoteProxy::MessageCenterRemoteProxy(long id) : PTC::Proxy(static_cast<int>(id), true)
{
}

void MessageCenterRemoteProxy::setTopWindow(MessageDefine::_tagTopWindowParam param)
{
    ServiceCall::invoke(*this, METHOD_setTopWindow, MessageCenterParams::serialize_setTopWindow_param(param));
}

void MessageCenterRemoteProxy::getTopWindow(int clientId)
{
    ServiceCall::invoke(*this, METHOD_getTopWindow,
                        MessageCenterParams::serialize_getTopWindow_param(clientId));
}

void MessageCenterRemoteProxy::postMessage(MessageDefine::_tagMessageParam param)
{
    ServiceCall::invoke(*this, METHOD_postMessage, MessageCenterParams::serialize_postMessage_param(param));
}

void MessageCenterRemoteProxy::closeMessage(MessageDefine::_tagCloseParam param)
{
    ServiceCall::invoke(*this, METHOD_closeMessage, MessageCenterParams::serialize_closeMessage_param(param));
}

void MessageCenterRemoteProxy::showBar(int bar)
{
    ServiceCall::invoke(*this, METHOD_showBar, MessageCenterParams::serialize_showBar_param(bar));
}

void MessageCenterRemoteProxy::unregisterCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterCallBack,
                        MessageCenterParams::serialize_unregisterCallBack_param(clientId));
}

void MessageCenterRemoteProxy::unregisterNotify(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterNotify,
                        MessageCenterParams::serialize_unregisterNotify_param(clientId));
}

void MessageCenterRemoteProxy::registerCallBack(IMessageCenterCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

void MessageCenterRemoteProxy::registerNotify(_tagMessageCenterNotify notify)
{
    ServiceCall::registerNotify(*this, METHOD_registerNotify, NOTIFY_ADAPTER_TYPE, notify.target,
                                notify.clientId);
}

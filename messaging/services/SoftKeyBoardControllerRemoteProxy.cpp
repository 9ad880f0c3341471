#include "messaging/services/SoftKeyBoardControllerRemoteProxy.h"

#include "messaging/services/ISoftKeyBoardControllerCallBack.h"
#include "messaging/services/ServiceCall.h"
#include "messaging/services/SoftKeyBoardControllerParams.h"

SoftKeyBoardControllerRemoteProxy::SoftKeyBoardControllerRemoteProxy(long id)
    : PTC::Proxy(static_cast<int>(id), true)
{
}

void SoftKeyBoardControllerRemoteProxy::show(SubCommonDefine::tagSoftKeyBoardInitData data)
{
    ServiceCall::invoke(*this, METHOD_show, SoftKeyBoardControllerParams::serialize_show_param(data));
}

void SoftKeyBoardControllerRemoteProxy::close()
{
    ServiceCall::invoke(*this, METHOD_close);
}

void SoftKeyBoardControllerRemoteProxy::dummyClose()
{
    ServiceCall::invoke(*this, METHOD_dummyClose);
}

void SoftKeyBoardControllerRemoteProxy::simpleClose()
{
    ServiceCall::invoke(*this, METHOD_simpleClose);
}

void SoftKeyBoardControllerRemoteProxy::sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key)
{
    ServiceCall::invoke(*this, METHOD_sendKey, SoftKeyBoardControllerParams::serialize_sendKey_param(key));
}

void SoftKeyBoardControllerRemoteProxy::sendLimitInfo(SubCommonDefine::taLimitInfo info)
{
    ServiceCall::invoke(*this, METHOD_sendLimitInfo,
                        SoftKeyBoardControllerParams::serialize_sendLimitInfo_param(info));
}

void SoftKeyBoardControllerRemoteProxy::closeLimitBalloon()
{
    ServiceCall::invoke(*this, METHOD_closeLimitBalloon);
}

void SoftKeyBoardControllerRemoteProxy::registerCallBack(ISoftKeyBoardControllerCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

void SoftKeyBoardControllerRemoteProxy::showMask()
{
    ServiceCall::invoke(*this, METHOD_showMask);
}

void SoftKeyBoardControllerRemoteProxy::hideMask()
{
    ServiceCall::invoke(*this, METHOD_hideMask);
}

bool SoftKeyBoardControllerRemoteProxy::isReachable() const
{
    return isConnected();
}

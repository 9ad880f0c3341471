#include "appliance/SoftKeyBoardControllerClientProxies.h"

#include "messaging/services/ServiceCall.h"
#include "messaging/services/SoftKeyBoardControllerCallBackAdapter.h"
#include "messaging/services/SoftKeyBoardControllerParams.h"

SoftKeyBoardControllerCallBackRemoteProxy::SoftKeyBoardControllerCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void SoftKeyBoardControllerCallBackRemoteProxy::sendInputString(std::wstring text)
{
    ServiceCall::invoke(*this, SoftKeyBoardControllerCallBackAdapter::METHOD_sendInputString,
                        SoftKeyBoardControllerParams::serialize_sendInputString_param(text));
}

void SoftKeyBoardControllerCallBackRemoteProxy::sendInputStringOnEnterPressing(std::wstring text)
{
    ServiceCall::invoke(*this, SoftKeyBoardControllerCallBackAdapter::METHOD_sendInputStringOnEnterPressing,
                        SoftKeyBoardControllerParams::serialize_sendInputStringOnEnterPressing_param(text));
}

void SoftKeyBoardControllerCallBackRemoteProxy::sendInputStringOnTextChanged(std::wstring text)
{
    ServiceCall::invoke(*this, SoftKeyBoardControllerCallBackAdapter::METHOD_sendInputStringOnTextChanged,
                        SoftKeyBoardControllerParams::serialize_sendInputStringOnTextChanged_param(text));
}

void SoftKeyBoardControllerCallBackRemoteProxy::sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key)
{
    ServiceCall::invoke(*this, SoftKeyBoardControllerCallBackAdapter::METHOD_sendKey,
                        SoftKeyBoardControllerParams::serialize_sendKey_param(key));
}

void SoftKeyBoardControllerCallBackRemoteProxy::sendInputStringSelectionPos(
    SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos position)
{
    ServiceCall::invoke(*this, SoftKeyBoardControllerCallBackAdapter::METHOD_sendInputStringSelectionPos,
                        SoftKeyBoardControllerParams::serialize_sendInputStringSelectionPos_param(position));
}

void SoftKeyBoardControllerCallBackRemoteProxy::sendSoftKeyboardState(bool shown)
{
    ServiceCall::invoke(*this, SoftKeyBoardControllerCallBackAdapter::METHOD_sendSoftKeyboardState,
                        SoftKeyBoardControllerParams::serialize_sendSoftKeyboardState_param(shown));
}

// The service side of SoftKeyBoardController: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/ISoftKeyBoardControllerCallBack.h"

class SoftKeyBoardControllerCallBackRemoteProxy : public ISoftKeyBoardControllerCallBack,
                                                  public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit SoftKeyBoardControllerCallBackRemoteProxy(long id);

    void sendInputString(std::wstring text) override;
    void sendInputStringOnEnterPressing(std::wstring text) override;
    void sendInputStringOnTextChanged(std::wstring text) override;
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key) override;
    void sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos position) override;
    void sendSoftKeyboardState(bool shown) override;
};

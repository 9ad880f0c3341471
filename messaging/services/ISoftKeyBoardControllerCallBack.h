// Answers of the service SoftKeyBoardController, implemented by its client. Called in the GUI thread.
#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <string>

class ISoftKeyBoardControllerCallBack
{
public:
    virtual ~ISoftKeyBoardControllerCallBack() = default;

    virtual void sendInputString(std::wstring text) = 0;
    virtual void sendInputStringOnEnterPressing(std::wstring text) = 0;
    virtual void sendInputStringOnTextChanged(std::wstring text) = 0;
    virtual void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key) = 0;
    virtual void
    sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos position) = 0;
    virtual void sendSoftKeyboardState(bool shown) = 0;
};

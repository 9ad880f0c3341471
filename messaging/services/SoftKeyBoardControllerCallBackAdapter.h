// Unpacks the answers of the service SoftKeyBoardController and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class ISoftKeyBoardControllerCallBack;

class SoftKeyBoardControllerCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_sendInputString = 1,
        METHOD_sendInputStringOnEnterPressing = 2,
        METHOD_sendInputStringOnTextChanged = 3,
        METHOD_sendKey = 4,
        METHOD_sendInputStringSelectionPos = 5,
        METHOD_sendSoftKeyboardState = 6,
    };

    explicit SoftKeyBoardControllerCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an ISoftKeyBoardControllerCallBack*; not owned.
    void setTarget(void* target) override;

private:
    ISoftKeyBoardControllerCallBack* m_target = nullptr;
};

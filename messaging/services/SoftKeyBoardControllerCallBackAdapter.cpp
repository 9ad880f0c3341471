#include "messaging/services/SoftKeyBoardControllerCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/ISoftKeyBoardControllerCallBack.h"
#include "messaging/services/SoftKeyBoardControllerParams.h"

SoftKeyBoardControllerCallBackAdapter::SoftKeyBoardControllerCallBackAdapter(long id)
    : PTC::CallbackAdapter(id)
{
}

void SoftKeyBoardControllerCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<ISoftKeyBoardControllerCallBack*>(target);
}

void SoftKeyBoardControllerCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_sendInputString: {
        std::wstring param;
        SoftKeyBoardControllerParams::deserialize_sendInputString_param(param, event->getData(),
                                                                        event->getSize());
        m_target->sendInputString(param);
        break;
    }
    case METHOD_sendInputStringOnEnterPressing: {
        std::wstring param;
        SoftKeyBoardControllerParams::deserialize_sendInputStringOnEnterPressing_param(
            param, event->getData(), event->getSize());
        m_target->sendInputStringOnEnterPressing(param);
        break;
    }
    case METHOD_sendInputStringOnTextChanged: {
        std::wstring param;
        SoftKeyBoardControllerParams::deserialize_sendInputStringOnTextChanged_param(param, event->getData(),
                                                                                     event->getSize());
        m_target->sendInputStringOnTextChanged(param);
        break;
    }
    case METHOD_sendKey: {
        SubCommonDefine::tagSoftKeyBoardKeyData param{};
        SoftKeyBoardControllerParams::deserialize_sendKey_param(param, event->getData(), event->getSize());
        m_target->sendKey(param);
        break;
    }
    case METHOD_sendInputStringSelectionPos: {
        SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos param{};
        SoftKeyBoardControllerParams::deserialize_sendInputStringSelectionPos_param(param, event->getData(),
                                                                                    event->getSize());
        m_target->sendInputStringSelectionPos(param);
        break;
    }
    case METHOD_sendSoftKeyboardState: {
        bool param = false;
        SoftKeyBoardControllerParams::deserialize_sendSoftKeyboardState_param(param, event->getData(),
                                                                              event->getSize());
        m_target->sendSoftKeyboardState(param);
        break;
    }
    default:
        break;
    }
}

// The service that shows the soft keyboard and sends its key events.
#pragma once

#include "messaging/services/ServiceInterface.h"
#include "messaging/services/SubCommonDefine.h"

class ISoftKeyBoardControllerCallBack;

// clang-format off
#define SoftKeyBoardController_CALLS(CALL) \
    CALL(1, show, SubCommonDefine::tagSoftKeyBoardInitData, data) \
    CALL(2, close) \
    CALL(3, dummyClose) \
    CALL(4, simpleClose) \
    CALL(5, sendKey, SubCommonDefine::tagSoftKeyBoardKeyData, key) \
    CALL(6, sendLimitInfo, SubCommonDefine::taLimitInfo, info) \
    CALL(7, closeLimitBalloon) \
    CALL(8, showMask) \
    CALL(9, hideMask) \
    CALL(10, registerCallBack, ISoftKeyBoardControllerCallBack*, target)

#define SoftKeyBoardController_ANSWERS(ANSWER) \
    ANSWER(1, sendInputString, std::wstring, text) \
    ANSWER(2, sendInputStringOnEnterPressing, std::wstring, text) \
    ANSWER(3, sendInputStringOnTextChanged, std::wstring, text) \
    ANSWER(4, sendKey, SubCommonDefine::tagSoftKeyBoardKeyData, key) \
    ANSWER(5, sendInputStringSelectionPos, SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos, position) \
    ANSWER(6, sendSoftKeyboardState, bool, shown)
// clang-format on

SERVICE(SoftKeyBoardController, 95, SUB_PANEL_CLIENT, 10, 96, ServiceTable::NO_ADAPTER);
SERVICE_ANSWERS(SoftKeyBoardController);

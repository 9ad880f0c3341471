// The service that shows the numbered message boxes.
#pragma once

#include "messaging/services/MessageDefine.h"
#include "messaging/services/ServiceInterface.h"

class IMessageCenterCallBack;
class IMessageCenterNotify;
using _tagMessageCenterNotify = NotifyTarget<IMessageCenterNotify>;

// clang-format off
#define MessageCenter_CALLS(CALL) \
    CALL(1, setTopWindow, MessageDefine::_tagTopWindowParam, window) \
    CALL(2, getTopWindow, int, clientId) \
    CALL(3, postMessage, MessageDefine::_tagMessageParam, message) \
    CALL(4, closeMessage, MessageDefine::_tagCloseParam, box) \
    CALL(5, showBar, int, bar) \
    CALL(6, unregisterCallBack, int, clientId) \
    CALL(7, unregisterNotify, int, clientId) \
    CALL(8, registerCallBack, IMessageCenterCallBack*, target) \
    CALL(9, registerNotify, _tagMessageCenterNotify, notify)

#define MessageCenter_ANSWERS(ANSWER) \
    ANSWER(1, setClientID, int, clientId) \
    ANSWER(2, getTopWindowCallBack, int, topWindow)

#define MessageCenter_EVENTS(NOTIFY) \
    NOTIFY(1, getTopWindowNotify, int, topWindow) \
    NOTIFY(2, postMessageNotify, MessageDefine::_tagMessageParam, message) \
    NOTIFY(3, closeMessageNotify, MessageDefine::_tagCloseParam, box) \
    NOTIFY(4, showBarNotify, int, bar)
// clang-format on

SERVICE(MessageCenter, 65, MAIN_CLIENT, 9, 66, 67);
SERVICE_ANSWERS(MessageCenter);
SERVICE_EVENTS(MessageCenter);

// The service that announces touch locks to the other processes.
#pragma once

#include "messaging/services/APPEventDefine.h"
#include "messaging/services/ServiceInterface.h"

class IAPPEventFilterCallBack;
class IAPPEventFilterNotify;
using _tagAPPEventFilterNotify = NotifyTarget<IAPPEventFilterNotify>;

// clang-format off
#define APPEventFilter_CALLS(CALL) \
    CALL(1, postAPPEventFilter, APPEventDefine::_tagAPPEvent, event) \
    CALL(2, postRestoreOriginal, APPEventDefine::_tagAPPEvent, event) \
    CALL(3, postRestoreFocus) \
    CALL(4, unregisterCallBack, int, clientId) \
    CALL(5, unregisterNotify, int, clientId) \
    CALL(6, registerCallBack, IAPPEventFilterCallBack*, target) \
    CALL(7, registerNotify, _tagAPPEventFilterNotify, notify)

#define APPEventFilter_ANSWERS(ANSWER) \
    ANSWER(1, setClientID, int, clientId)

#define APPEventFilter_EVENTS(NOTIFY) \
    NOTIFY(1, postAPPEventFilterNotify, APPEventDefine::_tagAPPEvent, event) \
    NOTIFY(2, postRestoreOriginalNotify, APPEventDefine::_tagAPPEvent, event) \
    NOTIFY(3, postRestoreFocusNotify)
// clang-format on

SERVICE(APPEventFilter, 1, MAIN_CLIENT, 7, 2, 3);
SERVICE_ANSWERS(APPEventFilter);
SERVICE_EVENTS(APPEventFilter);

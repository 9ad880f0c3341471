// The service that this program offers to its sibling processes.
//
// registerCallBack sets the callback that receives all further results; the implementation takes ownership of
// it. The data of a result is valid only during the call.
#pragma once

#include "messaging/services/ServiceInterface.h"
#include "messaging/services/TitlerDefine.h"

class ITitlerCallBack;

// clang-format off
#define Titler_CALLS(CALL) \
    CALL(1, showTitlerCreate, _CALL_TITLER_TYPE, type) \
    CALL(2, showTitlerEdit, _SHOW_TITLER_PARAMTER, title) \
    CALL(3, showDialogMaskWidget, bool, show) \
    CALL(4, showMessageMaskWidget, bool, show) \
    CALL(5, registerCallBack, ITitlerCallBack*, callBack)

#define Titler_ANSWERS(ANSWER) \
    ANSWER(1, finishTitlerCreateCallback, _CALLBACK_TITLER_PARAMTER, result)
// clang-format on

SERVICE(Titler, 117, TITLER_CLIENT, 5, 118, ServiceTable::NO_ADAPTER);
SERVICE_ANSWERS(Titler);

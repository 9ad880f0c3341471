// The service with which the sub panel process opens the titler.
#pragma once

#include "messaging/services/ServiceInterface.h"
#include "messaging/services/SubCommonDefine.h"

class IShowTitlerControllerCallBack;

// clang-format off
#define ShowTitlerController_CALLS(CALL) \
    CALL(1, setFolderStatus, SubCommonDefine::tagFOLDER_TYPE, folder) \
    CALL(2, registerCallBack, IShowTitlerControllerCallBack*, target)

#define ShowTitlerController_ANSWERS(ANSWER) \
    ANSWER(1, showTitler)
// clang-format on

SERVICE(ShowTitlerController, 92, SUB_PANEL_CLIENT, 2, 93, ServiceTable::NO_ADAPTER);
SERVICE_ANSWERS(ShowTitlerController);

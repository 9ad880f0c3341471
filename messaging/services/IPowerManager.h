// The service that reports that the appliance starts or shuts down.
#pragma once

#include "messaging/services/ServiceInterface.h"

class IPowerManagerCallBack;
class IPowerManagerNotify;
using _tagPowerManagerNotify = NotifyTarget<IPowerManagerNotify>;

// clang-format off
#define PowerManager_CALLS(CALL) \
    CALL(1, closeClient, int, clientId) \
    CALL(2, unregisterCallBack, int, clientId) \
    CALL(3, unregisterNotify, int, clientId) \
    CALL(4, inProcessing) \
    CALL(5, powerOff) \
    CALL(6, willPowerOff) \
    CALL(7, registerCallBack, IPowerManagerCallBack*, target) \
    CALL(8, registerNotify, _tagPowerManagerNotify, notify)

#define PowerManager_ANSWERS(ANSWER) \
    ANSWER(1, getClientID, int, clientId)

#define PowerManager_EVENTS(NOTIFY) \
    NOTIFY(1, powerOff) \
    NOTIFY(2, powerOn)
// clang-format on

SERVICE(PowerManager, 71, MAIN_CLIENT, 8, 72, 73);
SERVICE_ANSWERS(PowerManager);
SERVICE_EVENTS(PowerManager);

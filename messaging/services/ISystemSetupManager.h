// The service that provides the appliance's languages and model.
#pragma once

#include "messaging/services/ServiceInterface.h"
#include "messaging/services/SystemSetupDef.h"

class ISystemSetupManagerCallBack;
class ISystemSetupManagerNotify;
using _tagSystemSetupManagerNotify = NotifyTarget<ISystemSetupManagerNotify>;

// clang-format off
#define SystemSetupManager_CALLS(CALL) \
    CALL(1, getLanguageInfo, int, clientId) \
    CALL(16, getInformation, int, clientId) \
    CALL(62, unregisterCallBack, int, clientId) \
    CALL(63, unregisterNotifyCallBack, int, clientId) \
    CALL(64, registerCallBack, ISystemSetupManagerCallBack*, target) \
    CALL(65, registerNotifyCallBack, _tagSystemSetupManagerNotify, notify)

#define SystemSetupManager_ANSWERS(ANSWER) \
    ANSWER(1, getClientID, int, clientId) \
    ANSWER(2, getLanguageInfoCallBack, SystemSetupDef::tagSystemLanguageParam, language) \
    ANSWER(3, getInformationCallBack, SystemSetupDef::tagSystemInformation, information)

#define SystemSetupManager_EVENTS(NOTIFY) \
    NOTIFY(1, setSystemLanguageNotify, int, systemLanguage) \
    NOTIFY(2, setInputLanguageNotify, int, inputLanguage)
// clang-format on

SERVICE(SystemSetupManager, 114, MAIN_CLIENT, 65, 115, 116);
SERVICE_ANSWERS(SystemSetupManager);
SERVICE_EVENTS(SystemSetupManager);

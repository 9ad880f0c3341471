// The service that reports that a project was loaded.
#pragma once

#include "messaging/services/ServiceInterface.h"

class IProjectDataManagerCallBack;
class IProjectDataManagerNotify;
using _tagProjectDataManagerNotify = NotifyTarget<IProjectDataManagerNotify>;

// clang-format off
#define ProjectDataManager_CALLS(CALL) \
    CALL(7, unregisterCallBack, int, clientId) \
    CALL(8, unregisterNotifyCallBack, int, clientId) \
    CALL(9, registerCallBack, IProjectDataManagerCallBack*, target) \
    CALL(10, registerNotifyCallBack, _tagProjectDataManagerNotify, notify)

#define ProjectDataManager_ANSWERS(ANSWER) \
    ANSWER(1, getClientID, int, clientId)

#define ProjectDataManager_EVENTS(NOTIFY) \
    NOTIFY(1, loadNotify, int, state)
// clang-format on

SERVICE(ProjectDataManager, 76, MAIN_CLIENT, 10, 77, 78);
SERVICE_ANSWERS(ProjectDataManager);
SERVICE_EVENTS(ProjectDataManager);

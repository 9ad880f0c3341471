// The service that receives changes to titles and reports changes to files and folders.
#pragma once

#include "messaging/services/FileManagerDefine.h"
#include "messaging/services/ServiceInterface.h"

class IFileManagerControllerCallBack;
class IFileManagerControllerNotify;
using _tagFileManagerControllerNotify = NotifyTarget<IFileManagerControllerNotify>;

// clang-format off
#define FileManagerController_CALLS(CALL) \
    CALL(33, unregisterCallBack, int, clientId) \
    CALL(34, unregisterNotify, int, clientId) \
    CALL(72, updateTitlerStatus, FileManagerDefine::tagTitleChangeStatusParam, change) \
    CALL(73, renameFolderStart, FileManagerDefine::tagTitlerPathParam, folder) \
    CALL(74, updateTitlerFolderName, FileManagerDefine::tagChangeFolderNameParam, change) \
    CALL(75, titlerEditStatus, FileManagerDefine::tagTitlerPathParam, folder) \
    CALL(76, titlerEditEndStatus, FileManagerDefine::tagTitlerPathParam, folder) \
    CALL(77, updateTitlerOrder, FileManagerDefine::tagTitlerPathParam, folder) \
    CALL(78, registerCallBack, IFileManagerControllerCallBack*, target) \
    CALL(79, registerNotify, _tagFileManagerControllerNotify, notify)

#define FileManagerController_ANSWERS(ANSWER) \
    ANSWER(1, getClientID, int, clientId)

#define FileManagerController_EVENTS(NOTIFY) \
    NOTIFY(1, importNotify, FileManagerDefine::tagImportNotify, notice) \
    NOTIFY(2, deleteNotify, FileManagerDefine::tagDeleteNotify, notice) \
    NOTIFY(3, renameTitlerTemplateNotify, FileManagerDefine::tagRenameNotify, notice) \
    NOTIFY(4, updateTitlerFolderInFileManagerDelete, std::wstring, folderName) \
    NOTIFY(5, updateFolderNameInCurrentProjectNotify, FileManagerDefine::tagChangeFolderNameParam, change)
// clang-format on

SERVICE(FileManagerController, 36, MAIN_CLIENT, 79, 37, 38);
SERVICE_ANSWERS(FileManagerController);
SERVICE_EVENTS(FileManagerController);

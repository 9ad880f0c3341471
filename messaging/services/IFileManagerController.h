// The service that is told of changes to titles, and tells of changes to files and folders.
//
// Calls are one-way and run in the caller's thread; answers come as calls on IFileManagerControllerCallBack,
// events as calls on IFileManagerControllerNotify. Targets stay the caller's.
#pragma once

#include "messaging/services/FileManagerDefine.h"

class IFileManagerControllerCallBack;
struct _tagFileManagerControllerNotify;

class IFileManagerController
{
public:
    virtual ~IFileManagerController() = default;

    virtual void unregisterCallBack(int clientId) = 0;
    virtual void unregisterNotify(int clientId) = 0;
    virtual void updateTitlerStatus(FileManagerDefine::tagTitleChangeStatusParam param) = 0;
    virtual void renameFolderStart(FileManagerDefine::tagTitlerPathParam param) = 0;
    virtual void updateTitlerFolderName(FileManagerDefine::tagChangeFolderNameParam param) = 0;
    virtual void titlerEditStatus(FileManagerDefine::tagTitlerPathParam param) = 0;
    virtual void titlerEditEndStatus(FileManagerDefine::tagTitlerPathParam param) = 0;
    virtual void updateTitlerOrder(FileManagerDefine::tagTitlerPathParam param) = 0;
    virtual void registerCallBack(IFileManagerControllerCallBack* target) = 0;
    virtual void registerNotify(_tagFileManagerControllerNotify notify) = 0;
};

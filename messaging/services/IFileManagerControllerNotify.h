// Events of the service FileManagerController, implemented by its client. Called in the GUI thread.
#pragma once

#include "messaging/services/FileManagerDefine.h"

#include <string>

class IFileManagerControllerNotify
{
public:
    virtual ~IFileManagerControllerNotify() = default;

    virtual void importNotify(FileManagerDefine::tagImportNotify param) = 0;
    virtual void deleteNotify(FileManagerDefine::tagDeleteNotify param) = 0;
    virtual void renameTitlerTemplateNotify(FileManagerDefine::tagRenameNotify param) = 0;
    virtual void updateTitlerFolderInFileManagerDelete(std::wstring folderName) = 0;
    virtual void
    updateFolderNameInCurrentProjectNotify(FileManagerDefine::tagChangeFolderNameParam param) = 0;
};

// Whom to tell of the events, and the client id that the service gave. target stays the caller's.
struct _tagFileManagerControllerNotify {
    IFileManagerControllerNotify* target = nullptr;
    int clientId = -1;
};

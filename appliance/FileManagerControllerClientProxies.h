// The service side of FileManagerController: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/IFileManagerControllerCallBack.h"
#include "messaging/services/IFileManagerControllerNotify.h"

class FileManagerControllerCallBackRemoteProxy : public IFileManagerControllerCallBack,
                                                 public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit FileManagerControllerCallBackRemoteProxy(long id);

    void getClientID(int clientId) override;
};

class FileManagerControllerNotifyRemoteProxy : public IFileManagerControllerNotify, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit FileManagerControllerNotifyRemoteProxy(long id);

    void importNotify(FileManagerDefine::tagImportNotify param) override;
    void deleteNotify(FileManagerDefine::tagDeleteNotify param) override;
    void renameTitlerTemplateNotify(FileManagerDefine::tagRenameNotify param) override;
    void updateTitlerFolderInFileManagerDelete(std::wstring folderName) override;
    void updateFolderNameInCurrentProjectNotify(FileManagerDefine::tagChangeFolderNameParam param) override;
};

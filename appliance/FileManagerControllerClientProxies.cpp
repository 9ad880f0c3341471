#include "appliance/FileManagerControllerClientProxies.h"

#include "messaging/services/FileManagerControllerCallBackAdapter.h"
#include "messaging/services/FileManagerControllerNotifyAdapter.h"
#include "messaging/services/FileManagerControllerParams.h"
#include "messaging/services/ServiceCall.h"

FileManagerControllerCallBackRemoteProxy::FileManagerControllerCallBackRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void FileManagerControllerCallBackRemoteProxy::getClientID(int clientId)
{
    ServiceCall::invoke(*this, FileManagerControllerCallBackAdapter::METHOD_getClientID,
                        FileManagerControllerParams::serialize_getClientID_param(clientId));
}

FileManagerControllerNotifyRemoteProxy::FileManagerControllerNotifyRemoteProxy(long id)
    : PTC::CallbackProxy(static_cast<int>(id), true)
{
}

void FileManagerControllerNotifyRemoteProxy::importNotify(FileManagerDefine::tagImportNotify param)
{
    ServiceCall::invoke(*this, FileManagerControllerNotifyAdapter::METHOD_importNotify,
                        FileManagerControllerParams::serialize_importNotify_param(param));
}

void FileManagerControllerNotifyRemoteProxy::deleteNotify(FileManagerDefine::tagDeleteNotify param)
{
    ServiceCall::invoke(*this, FileManagerControllerNotifyAdapter::METHOD_deleteNotify,
                        FileManagerControllerParams::serialize_deleteNotify_param(param));
}

void FileManagerControllerNotifyRemoteProxy::renameTitlerTemplateNotify(
    FileManagerDefine::tagRenameNotify param)
{
    ServiceCall::invoke(*this, FileManagerControllerNotifyAdapter::METHOD_renameTitlerTemplateNotify,
                        FileManagerControllerParams::serialize_renameTitlerTemplateNotify_param(param));
}

void FileManagerControllerNotifyRemoteProxy::updateTitlerFolderInFileManagerDelete(std::wstring folderName)
{
    ServiceCall::invoke(
        *this, FileManagerControllerNotifyAdapter::METHOD_updateTitlerFolderInFileManagerDelete,
        FileManagerControllerParams::serialize_updateTitlerFolderInFileManagerDelete_param(folderName));
}

void FileManagerControllerNotifyRemoteProxy::updateFolderNameInCurrentProjectNotify(
    FileManagerDefine::tagChangeFolderNameParam param)
{
    ServiceCall::invoke(
        *this, FileManagerControllerNotifyAdapter::METHOD_updateFolderNameInCurrentProjectNotify,
        FileManagerControllerParams::serialize_updateFolderNameInCurrentProjectNotify_param(param));
}

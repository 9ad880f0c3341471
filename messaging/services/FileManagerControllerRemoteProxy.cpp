#include "messaging/services/FileManagerControllerRemoteProxy.h"

#include "messaging/services/FileManagerControllerParams.h"
#include "messaging/services/IFileManagerControllerCallBack.h"
#include "messaging/services/IFileManagerControllerNotify.h"
#include "messaging/services/ServiceCall.h"

FileManagerControllerRemoteProxy::FileManagerControllerRemoteProxy(long id)
    : PTC::Proxy(static_cast<int>(id), true)
{
}

void FileManagerControllerRemoteProxy::unregisterCallBack(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterCallBack,
                        FileManagerControllerParams::serialize_unregisterCallBack_param(clientId));
}

void FileManagerControllerRemoteProxy::unregisterNotify(int clientId)
{
    ServiceCall::invoke(*this, METHOD_unregisterNotify,
                        FileManagerControllerParams::serialize_unregisterNotify_param(clientId));
}

void FileManagerControllerRemoteProxy::updateTitlerStatus(FileManagerDefine::tagTitleChangeStatusParam param)
{
    ServiceCall::invoke(*this, METHOD_updateTitlerStatus,
                        FileManagerControllerParams::serialize_updateTitlerStatus_param(param));
}

void FileManagerControllerRemoteProxy::renameFolderStart(FileManagerDefine::tagTitlerPathParam param)
{
    ServiceCall::invoke(*this, METHOD_renameFolderStart,
                        FileManagerControllerParams::serialize_renameFolderStart_param(param));
}

void FileManagerControllerRemoteProxy::updateTitlerFolderName(
    FileManagerDefine::tagChangeFolderNameParam param)
{
    ServiceCall::invoke(*this, METHOD_updateTitlerFolderName,
                        FileManagerControllerParams::serialize_updateTitlerFolderName_param(param));
}

void FileManagerControllerRemoteProxy::titlerEditStatus(FileManagerDefine::tagTitlerPathParam param)
{
    ServiceCall::invoke(*this, METHOD_titlerEditStatus,
                        FileManagerControllerParams::serialize_titlerEditStatus_param(param));
}

void FileManagerControllerRemoteProxy::titlerEditEndStatus(FileManagerDefine::tagTitlerPathParam param)
{
    ServiceCall::invoke(*this, METHOD_titlerEditEndStatus,
                        FileManagerControllerParams::serialize_titlerEditEndStatus_param(param));
}

void FileManagerControllerRemoteProxy::updateTitlerOrder(FileManagerDefine::tagTitlerPathParam param)
{
    ServiceCall::invoke(*this, METHOD_updateTitlerOrder,
                        FileManagerControllerParams::serialize_updateTitlerOrder_param(param));
}

void FileManagerControllerRemoteProxy::registerCallBack(IFileManagerControllerCallBack* target)
{
    ServiceCall::registerCallBack(*this, METHOD_registerCallBack, CALLBACK_ADAPTER_TYPE, target);
}

void FileManagerControllerRemoteProxy::registerNotify(_tagFileManagerControllerNotify notify)
{
    ServiceCall::registerNotify(*this, METHOD_registerNotify, NOTIFY_ADAPTER_TYPE, notify.target,
                                notify.clientId);
}

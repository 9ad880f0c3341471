// Packing of the parameters of the service FileManagerController, its answers and its events. A buffer that
// serialize_ returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values
// where the data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/FileManagerDefine.h"

#include <string>

namespace FileManagerControllerParams
{

simplebuffer serialize_unregisterCallBack_param(int param);
void deserialize_unregisterCallBack_param(int& param, void* data, long size);
simplebuffer serialize_unregisterNotify_param(int param);
void deserialize_unregisterNotify_param(int& param, void* data, long size);
simplebuffer serialize_updateTitlerStatus_param(const FileManagerDefine::tagTitleChangeStatusParam& param);
void deserialize_updateTitlerStatus_param(FileManagerDefine::tagTitleChangeStatusParam& param, void* data,
                                          long size);
simplebuffer serialize_renameFolderStart_param(const FileManagerDefine::tagTitlerPathParam& param);
void deserialize_renameFolderStart_param(FileManagerDefine::tagTitlerPathParam& param, void* data, long size);
simplebuffer serialize_updateTitlerFolderName_param(const FileManagerDefine::tagChangeFolderNameParam& param);
void deserialize_updateTitlerFolderName_param(FileManagerDefine::tagChangeFolderNameParam& param, void* data,
                                              long size);
simplebuffer serialize_titlerEditStatus_param(const FileManagerDefine::tagTitlerPathParam& param);
void deserialize_titlerEditStatus_param(FileManagerDefine::tagTitlerPathParam& param, void* data, long size);
simplebuffer serialize_titlerEditEndStatus_param(const FileManagerDefine::tagTitlerPathParam& param);
void deserialize_titlerEditEndStatus_param(FileManagerDefine::tagTitlerPathParam& param, void* data,
                                           long size);
simplebuffer serialize_updateTitlerOrder_param(const FileManagerDefine::tagTitlerPathParam& param);
void deserialize_updateTitlerOrder_param(FileManagerDefine::tagTitlerPathParam& param, void* data, long size);
simplebuffer serialize_getClientID_param(int param);
void deserialize_getClientID_param(int& param, void* data, long size);
simplebuffer serialize_importNotify_param(const FileManagerDefine::tagImportNotify& param);
void deserialize_importNotify_param(FileManagerDefine::tagImportNotify& param, void* data, long size);
simplebuffer serialize_deleteNotify_param(const FileManagerDefine::tagDeleteNotify& param);
void deserialize_deleteNotify_param(FileManagerDefine::tagDeleteNotify& param, void* data, long size);
simplebuffer serialize_renameTitlerTemplateNotify_param(const FileManagerDefine::tagRenameNotify& param);
void deserialize_renameTitlerTemplateNotify_param(FileManagerDefine::tagRenameNotify& param, void* data,
                                                  long size);
simplebuffer serialize_updateTitlerFolderInFileManagerDelete_param(const std::wstring& param);
void deserialize_updateTitlerFolderInFileManagerDelete_param(std::wstring& param, void* data, long size);
simplebuffer serialize_updateFolderNameInCurrentProjectNotify_param(
    const FileManagerDefine::tagChangeFolderNameParam& param);
void deserialize_updateFolderNameInCurrentProjectNotify_param(
    FileManagerDefine::tagChangeFolderNameParam& param, void* data, long size);

} // namespace FileManagerControllerParams

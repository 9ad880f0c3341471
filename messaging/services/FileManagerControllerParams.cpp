#include "messaging/services/FileManagerControllerParams.h"

#include "messaging/services/RecordPacking.h"

namespace FileManagerControllerParams
{

simplebuffer serialize_unregisterCallBack_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_unregisterCallBack_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_unregisterNotify_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_unregisterNotify_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_updateTitlerStatus_param(const FileManagerDefine::tagTitleChangeStatusParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_updateTitlerStatus_param(FileManagerDefine::tagTitleChangeStatusParam& param, void* data,
                                          long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_renameFolderStart_param(const FileManagerDefine::tagTitlerPathParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_renameFolderStart_param(FileManagerDefine::tagTitlerPathParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_updateTitlerFolderName_param(const FileManagerDefine::tagChangeFolderNameParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_updateTitlerFolderName_param(FileManagerDefine::tagChangeFolderNameParam& param, void* data,
                                              long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_titlerEditStatus_param(const FileManagerDefine::tagTitlerPathParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_titlerEditStatus_param(FileManagerDefine::tagTitlerPathParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_titlerEditEndStatus_param(const FileManagerDefine::tagTitlerPathParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_titlerEditEndStatus_param(FileManagerDefine::tagTitlerPathParam& param, void* data,
                                           long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_updateTitlerOrder_param(const FileManagerDefine::tagTitlerPathParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_updateTitlerOrder_param(FileManagerDefine::tagTitlerPathParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_getClientID_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getClientID_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_importNotify_param(const FileManagerDefine::tagImportNotify& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_importNotify_param(FileManagerDefine::tagImportNotify& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_deleteNotify_param(const FileManagerDefine::tagDeleteNotify& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_deleteNotify_param(FileManagerDefine::tagDeleteNotify& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_renameTitlerTemplateNotify_param(const FileManagerDefine::tagRenameNotify& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_renameTitlerTemplateNotify_param(FileManagerDefine::tagRenameNotify& param, void* data,
                                                  long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_updateTitlerFolderInFileManagerDelete_param(const std::wstring& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_updateTitlerFolderInFileManagerDelete_param(std::wstring& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_updateFolderNameInCurrentProjectNotify_param(
    const FileManagerDefine::tagChangeFolderNameParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_updateFolderNameInCurrentProjectNotify_param(
    FileManagerDefine::tagChangeFolderNameParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace FileManagerControllerParams

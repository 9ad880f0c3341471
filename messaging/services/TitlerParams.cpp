#include "messaging/services/TitlerParams.h"

#include "messaging/services/RecordPacking.h"

namespace TitlerParams
{

simplebuffer serialize_showTitlerCreate_param(_CALL_TITLER_TYPE param)
{
    return RecordPacking::serialize(param);
}

void deserialize_showTitlerCreate_param(_CALL_TITLER_TYPE& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_showTitlerEdit_param(const _SHOW_TITLER_PARAMTER& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_showTitlerEdit_param(_SHOW_TITLER_PARAMTER& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_showDialogMaskWidget_param(bool param)
{
    return RecordPacking::serialize(param);
}

void deserialize_showDialogMaskWidget_param(bool& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_showMessageMaskWidget_param(bool param)
{
    return RecordPacking::serialize(param);
}

void deserialize_showMessageMaskWidget_param(bool& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_registerCallBack_param(const _tagCallBackInfo& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_registerCallBack_param(_tagCallBackInfo& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_finishTitlerCreateCallback_param(const _CALLBACK_TITLER_PARAMTER& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_finishTitlerCreateCallback_param(_CALLBACK_TITLER_PARAMTER& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

std::vector<std::wstring> unpackPaths(const _CALLBACK_TITLER_PARAMTER& param)
{
    std::vector<std::wstring> paths;
    RecordReader reader(param.data, param.size);
    for (int i = 0; i < param.count && !reader.atEnd(); ++i) {
        std::wstring path = reader.readWide();
        if (reader.failed()) {
            break;
        }
        paths.push_back(std::move(path));
    }
    return paths;
}

} // namespace TitlerParams

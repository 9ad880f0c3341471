#include "messaging/services/APPEventFilterParams.h"

#include "messaging/services/RecordPacking.h"

namespace APPEventFilterParams
{

simplebuffer serialize_postAPPEventFilter_param(const APPEventDefine::_tagAPPEvent& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_postAPPEventFilter_param(APPEventDefine::_tagAPPEvent& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_postRestoreOriginal_param(const APPEventDefine::_tagAPPEvent& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_postRestoreOriginal_param(APPEventDefine::_tagAPPEvent& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

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

simplebuffer serialize_setClientID_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_setClientID_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_postAPPEventFilterNotify_param(const APPEventDefine::_tagAPPEvent& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_postAPPEventFilterNotify_param(APPEventDefine::_tagAPPEvent& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_postRestoreOriginalNotify_param(const APPEventDefine::_tagAPPEvent& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_postRestoreOriginalNotify_param(APPEventDefine::_tagAPPEvent& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace APPEventFilterParams

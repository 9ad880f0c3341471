#include "messaging/services/ProjectDataManagerParams.h"

#include "messaging/services/RecordPacking.h"

namespace ProjectDataManagerParams
{

simplebuffer serialize_unregisterCallBack_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_unregisterCallBack_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_unregisterNotifyCallBack_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_unregisterNotifyCallBack_param(int& param, void* data, long size)
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

simplebuffer serialize_loadNotify_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_loadNotify_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace ProjectDataManagerParams

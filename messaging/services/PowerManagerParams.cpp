#include "messaging/services/PowerManagerParams.h"

#include "messaging/services/RecordPacking.h"

namespace PowerManagerParams
{

simplebuffer serialize_closeClient_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_closeClient_param(int& param, void* data, long size)
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

simplebuffer serialize_getClientID_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getClientID_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace PowerManagerParams

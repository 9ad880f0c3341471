#include "messaging/services/MessageCenterParams.h"

#include "messaging/services/RecordPacking.h"

namespace MessageCenterParams
{

simplebuffer serialize_setTopWindow_param(const MessageDefine::_tagTopWindowParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_setTopWindow_param(MessageDefine::_tagTopWindowParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_getTopWindow_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getTopWindow_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_postMessage_param(const MessageDefine::_tagMessageParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_postMessage_param(MessageDefine::_tagMessageParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_closeMessage_param(const MessageDefine::_tagCloseParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_closeMessage_param(MessageDefine::_tagCloseParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_showBar_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_showBar_param(int& param, void* data, long size)
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

simplebuffer serialize_getTopWindowCallBack_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getTopWindowCallBack_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_getTopWindowNotify_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getTopWindowNotify_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_postMessageNotify_param(const MessageDefine::_tagMessageParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_postMessageNotify_param(MessageDefine::_tagMessageParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_closeMessageNotify_param(const MessageDefine::_tagCloseParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_closeMessageNotify_param(MessageDefine::_tagCloseParam& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_showBarNotify_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_showBarNotify_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace MessageCenterParams

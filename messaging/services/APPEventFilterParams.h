// Packing of the parameters of the service APPEventFilter, its answers and its events. A buffer that
// serialize_ returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values
// where the data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/APPEventDefine.h"

namespace APPEventFilterParams
{

simplebuffer serialize_postAPPEventFilter_param(const APPEventDefine::_tagAPPEvent& param);
void deserialize_postAPPEventFilter_param(APPEventDefine::_tagAPPEvent& param, void* data, long size);
simplebuffer serialize_postRestoreOriginal_param(const APPEventDefine::_tagAPPEvent& param);
void deserialize_postRestoreOriginal_param(APPEventDefine::_tagAPPEvent& param, void* data, long size);
simplebuffer serialize_unregisterCallBack_param(int param);
void deserialize_unregisterCallBack_param(int& param, void* data, long size);
simplebuffer serialize_unregisterNotify_param(int param);
void deserialize_unregisterNotify_param(int& param, void* data, long size);
simplebuffer serialize_setClientID_param(int param);
void deserialize_setClientID_param(int& param, void* data, long size);
simplebuffer serialize_postAPPEventFilterNotify_param(const APPEventDefine::_tagAPPEvent& param);
void deserialize_postAPPEventFilterNotify_param(APPEventDefine::_tagAPPEvent& param, void* data, long size);
simplebuffer serialize_postRestoreOriginalNotify_param(const APPEventDefine::_tagAPPEvent& param);
void deserialize_postRestoreOriginalNotify_param(APPEventDefine::_tagAPPEvent& param, void* data, long size);

} // namespace APPEventFilterParams

// Packing of the parameters of the service ProjectDataManager, its answers and its events. A buffer that
// serialize_ returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values
// where the data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"

namespace ProjectDataManagerParams
{

simplebuffer serialize_unregisterCallBack_param(int param);
void deserialize_unregisterCallBack_param(int& param, void* data, long size);
simplebuffer serialize_unregisterNotifyCallBack_param(int param);
void deserialize_unregisterNotifyCallBack_param(int& param, void* data, long size);
simplebuffer serialize_getClientID_param(int param);
void deserialize_getClientID_param(int& param, void* data, long size);
simplebuffer serialize_loadNotify_param(int param);
void deserialize_loadNotify_param(int& param, void* data, long size);

} // namespace ProjectDataManagerParams

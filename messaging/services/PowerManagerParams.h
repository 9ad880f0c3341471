// Packing of the parameters of the service PowerManager, its answers and its events. A buffer that serialize_
// returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values where the
// data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"

namespace PowerManagerParams
{

simplebuffer serialize_closeClient_param(int param);
void deserialize_closeClient_param(int& param, void* data, long size);
simplebuffer serialize_unregisterCallBack_param(int param);
void deserialize_unregisterCallBack_param(int& param, void* data, long size);
simplebuffer serialize_unregisterNotify_param(int param);
void deserialize_unregisterNotify_param(int& param, void* data, long size);
simplebuffer serialize_getClientID_param(int param);
void deserialize_getClientID_param(int& param, void* data, long size);

} // namespace PowerManagerParams

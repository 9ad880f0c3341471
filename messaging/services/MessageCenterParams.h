// Packing of the parameters of the service MessageCenter, its answers and its events. A buffer that
// serialize_ returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values
// where the data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/MessageDefine.h"

namespace MessageCenterParams
{

simplebuffer serialize_setTopWindow_param(const MessageDefine::_tagTopWindowParam& param);
void deserialize_setTopWindow_param(MessageDefine::_tagTopWindowParam& param, void* data, long size);
simplebuffer serialize_getTopWindow_param(int param);
void deserialize_getTopWindow_param(int& param, void* data, long size);
simplebuffer serialize_postMessage_param(const MessageDefine::_tagMessageParam& param);
void deserialize_postMessage_param(MessageDefine::_tagMessageParam& param, void* data, long size);
simplebuffer serialize_closeMessage_param(const MessageDefine::_tagCloseParam& param);
void deserialize_closeMessage_param(MessageDefine::_tagCloseParam& param, void* data, long size);
simplebuffer serialize_showBar_param(int param);
void deserialize_showBar_param(int& param, void* data, long size);
simplebuffer serialize_unregisterCallBack_param(int param);
void deserialize_unregisterCallBack_param(int& param, void* data, long size);
simplebuffer serialize_unregisterNotify_param(int param);
void deserialize_unregisterNotify_param(int& param, void* data, long size);
simplebuffer serialize_setClientID_param(int param);
void deserialize_setClientID_param(int& param, void* data, long size);
simplebuffer serialize_getTopWindowCallBack_param(int param);
void deserialize_getTopWindowCallBack_param(int& param, void* data, long size);
simplebuffer serialize_getTopWindowNotify_param(int param);
void deserialize_getTopWindowNotify_param(int& param, void* data, long size);
simplebuffer serialize_postMessageNotify_param(const MessageDefine::_tagMessageParam& param);
void deserialize_postMessageNotify_param(MessageDefine::_tagMessageParam& param, void* data, long size);
simplebuffer serialize_closeMessageNotify_param(const MessageDefine::_tagCloseParam& param);
void deserialize_closeMessageNotify_param(MessageDefine::_tagCloseParam& param, void* data, long size);
simplebuffer serialize_showBarNotify_param(int param);
void deserialize_showBarNotify_param(int& param, void* data, long size);

} // namespace MessageCenterParams

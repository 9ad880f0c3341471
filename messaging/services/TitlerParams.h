// Packing of the parameters of ITitler and ITitlerCallBack. A buffer that serialize_ returns is destroyed by
// the caller; deserialize_ reads at most size bytes and leaves zero values where the data ends or cannot be
// read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/TitlerDefine.h"

#include <string>
#include <vector>

namespace TitlerParams
{

simplebuffer serialize_showTitlerCreate_param(_CALL_TITLER_TYPE param);
void deserialize_showTitlerCreate_param(_CALL_TITLER_TYPE& param, void* data, long size);
simplebuffer serialize_showTitlerEdit_param(const _SHOW_TITLER_PARAMTER& param);
void deserialize_showTitlerEdit_param(_SHOW_TITLER_PARAMTER& param, void* data, long size);
simplebuffer serialize_showDialogMaskWidget_param(bool param);
void deserialize_showDialogMaskWidget_param(bool& param, void* data, long size);
simplebuffer serialize_showMessageMaskWidget_param(bool param);
void deserialize_showMessageMaskWidget_param(bool& param, void* data, long size);
simplebuffer serialize_registerCallBack_param(const _tagCallBackInfo& param);
void deserialize_registerCallBack_param(_tagCallBackInfo& param, void* data, long size);
simplebuffer serialize_finishTitlerCreateCallback_param(const _CALLBACK_TITLER_PARAMTER& param);
// The record's data points into the message, and its size is no more than the message holds.
void deserialize_finishTitlerCreateCallback_param(_CALLBACK_TITLER_PARAMTER& param, void* data, long size);

// The paths packed in a record's data; no more than the data holds, whatever its count says.
std::vector<std::wstring> unpackPaths(const _CALLBACK_TITLER_PARAMTER& param);

} // namespace TitlerParams

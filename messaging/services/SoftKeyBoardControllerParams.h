// Packing of the parameters of the service SoftKeyBoardController, its answers and its events. A buffer that
// serialize_ returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values
// where the data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/SubCommonDefine.h"

#include <string>

namespace SoftKeyBoardControllerParams
{

simplebuffer serialize_show_param(const SubCommonDefine::tagSoftKeyBoardInitData& param);
void deserialize_show_param(SubCommonDefine::tagSoftKeyBoardInitData& param, void* data, long size);
simplebuffer serialize_sendKey_param(const SubCommonDefine::tagSoftKeyBoardKeyData& param);
void deserialize_sendKey_param(SubCommonDefine::tagSoftKeyBoardKeyData& param, void* data, long size);
simplebuffer serialize_sendLimitInfo_param(const SubCommonDefine::taLimitInfo& param);
void deserialize_sendLimitInfo_param(SubCommonDefine::taLimitInfo& param, void* data, long size);
simplebuffer serialize_sendInputString_param(const std::wstring& param);
void deserialize_sendInputString_param(std::wstring& param, void* data, long size);
simplebuffer serialize_sendInputStringOnEnterPressing_param(const std::wstring& param);
void deserialize_sendInputStringOnEnterPressing_param(std::wstring& param, void* data, long size);
simplebuffer serialize_sendInputStringOnTextChanged_param(const std::wstring& param);
void deserialize_sendInputStringOnTextChanged_param(std::wstring& param, void* data, long size);
simplebuffer
serialize_sendInputStringSelectionPos_param(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& param);
void deserialize_sendInputStringSelectionPos_param(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& param,
                                                   void* data, long size);
simplebuffer serialize_sendSoftKeyboardState_param(bool param);
void deserialize_sendSoftKeyboardState_param(bool& param, void* data, long size);

} // namespace SoftKeyBoardControllerParams

#include "messaging/services/SoftKeyBoardControllerParams.h"

#include "messaging/services/RecordPacking.h"

namespace SoftKeyBoardControllerParams
{

simplebuffer serialize_show_param(const SubCommonDefine::tagSoftKeyBoardInitData& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_show_param(SubCommonDefine::tagSoftKeyBoardInitData& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_sendKey_param(const SubCommonDefine::tagSoftKeyBoardKeyData& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_sendKey_param(SubCommonDefine::tagSoftKeyBoardKeyData& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_sendLimitInfo_param(const SubCommonDefine::taLimitInfo& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_sendLimitInfo_param(SubCommonDefine::taLimitInfo& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_sendInputString_param(const std::wstring& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_sendInputString_param(std::wstring& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_sendInputStringOnEnterPressing_param(const std::wstring& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_sendInputStringOnEnterPressing_param(std::wstring& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_sendInputStringOnTextChanged_param(const std::wstring& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_sendInputStringOnTextChanged_param(std::wstring& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer
serialize_sendInputStringSelectionPos_param(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_sendInputStringSelectionPos_param(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& param,
                                                   void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_sendSoftKeyboardState_param(bool param)
{
    return RecordPacking::serialize(param);
}

void deserialize_sendSoftKeyboardState_param(bool& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace SoftKeyBoardControllerParams

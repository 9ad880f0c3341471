#include "messaging/services/SystemSetupManagerParams.h"

#include "messaging/services/RecordPacking.h"

namespace SystemSetupManagerParams
{

simplebuffer serialize_getLanguageInfo_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getLanguageInfo_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_getInformation_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getInformation_param(int& param, void* data, long size)
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

simplebuffer serialize_getLanguageInfoCallBack_param(const SystemSetupDef::tagSystemLanguageParam& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getLanguageInfoCallBack_param(SystemSetupDef::tagSystemLanguageParam& param, void* data,
                                               long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_getInformationCallBack_param(const SystemSetupDef::tagSystemInformation& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_getInformationCallBack_param(SystemSetupDef::tagSystemInformation& param, void* data,
                                              long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_setSystemLanguageNotify_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_setSystemLanguageNotify_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

simplebuffer serialize_setInputLanguageNotify_param(int param)
{
    return RecordPacking::serialize(param);
}

void deserialize_setInputLanguageNotify_param(int& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace SystemSetupManagerParams

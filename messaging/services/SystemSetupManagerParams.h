// Packing of the parameters of the service SystemSetupManager, its answers and its events. A buffer that
// serialize_ returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values
// where the data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/SystemSetupDef.h"

namespace SystemSetupManagerParams
{

simplebuffer serialize_getLanguageInfo_param(int param);
void deserialize_getLanguageInfo_param(int& param, void* data, long size);
simplebuffer serialize_getInformation_param(int param);
void deserialize_getInformation_param(int& param, void* data, long size);
simplebuffer serialize_unregisterCallBack_param(int param);
void deserialize_unregisterCallBack_param(int& param, void* data, long size);
simplebuffer serialize_unregisterNotifyCallBack_param(int param);
void deserialize_unregisterNotifyCallBack_param(int& param, void* data, long size);
simplebuffer serialize_getClientID_param(int param);
void deserialize_getClientID_param(int& param, void* data, long size);
simplebuffer serialize_getLanguageInfoCallBack_param(const SystemSetupDef::tagSystemLanguageParam& param);
void deserialize_getLanguageInfoCallBack_param(SystemSetupDef::tagSystemLanguageParam& param, void* data,
                                               long size);
simplebuffer serialize_getInformationCallBack_param(const SystemSetupDef::tagSystemInformation& param);
void deserialize_getInformationCallBack_param(SystemSetupDef::tagSystemInformation& param, void* data,
                                              long size);
simplebuffer serialize_setSystemLanguageNotify_param(int param);
void deserialize_setSystemLanguageNotify_param(int& param, void* data, long size);
simplebuffer serialize_setInputLanguageNotify_param(int param);
void deserialize_setInputLanguageNotify_param(int& param, void* data, long size);

} // namespace SystemSetupManagerParams

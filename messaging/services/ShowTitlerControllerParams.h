// Packing of the parameters of the service ShowTitlerController, its answers and its events. A buffer that
// serialize_ returns is destroyed by the caller; deserialize_ reads at most size bytes and leaves zero values
// where the data ends or cannot be read.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/services/SubCommonDefine.h"

namespace ShowTitlerControllerParams
{

simplebuffer serialize_setFolderStatus_param(const SubCommonDefine::tagFOLDER_TYPE& param);
void deserialize_setFolderStatus_param(SubCommonDefine::tagFOLDER_TYPE& param, void* data, long size);

} // namespace ShowTitlerControllerParams

#include "messaging/services/ShowTitlerControllerParams.h"

#include "messaging/services/RecordPacking.h"

namespace ShowTitlerControllerParams
{

simplebuffer serialize_setFolderStatus_param(const SubCommonDefine::tagFOLDER_TYPE& param)
{
    return RecordPacking::serialize(param);
}

void deserialize_setFolderStatus_param(SubCommonDefine::tagFOLDER_TYPE& param, void* data, long size)
{
    RecordPacking::deserialize(param, data, size);
}

} // namespace ShowTitlerControllerParams

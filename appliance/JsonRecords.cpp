#include "appliance/JsonRecords.h"

#include "messaging/services/TitlerParams.h"

namespace JsonRecords
{

QJsonObject toJson(const _CALLBACK_TITLER_PARAMTER& record)
{
    QJsonArray paths;
    for (const std::wstring& path : TitlerParams::unpackPaths(record))
        paths.append(toValue(path));
    return {{"type", record.type},
            {"path", toValue(record.path)},
            {"size", record.size},
            {"count", record.count},
            {"paths", paths}};
}

} // namespace JsonRecords

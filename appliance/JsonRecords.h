#pragma once

#include "messaging/services/RecordPacking.h"

#include <QJsonArray>
#include <QJsonObject>
#include <QString>

// Converts the records of the wire to and from JSON objects with the same field names.
namespace JsonRecords
{

inline QJsonValue toValue(int value)
{
    return value;
}
inline QJsonValue toValue(bool value)
{
    return value;
}
inline QJsonValue toValue(long value)
{
    return static_cast<qint64>(value);
}
inline QJsonValue toValue(const std::wstring& value)
{
    return QString::fromStdWString(value);
}
template <typename Value, std::size_t COUNT>
QJsonValue toValue(const Value (&values)[COUNT])
{
    QJsonArray array;
    for (const Value& value : values)
        array.append(toValue(value));
    return array;
}

template <RecordPacking::HasFields Record>
QJsonObject toJson(const Record& record)
{
    QJsonObject json;
    Record::forEachField(record, [&json](auto, const char* field, const auto& value) {
        json.insert(QLatin1String(field), toValue(value));
    });
    return json;
}
// Also unpacks the paths.
QJsonObject toJson(const _CALLBACK_TITLER_PARAMTER& record);

inline void fromValue(const QJsonValue& json, int& value)
{
    value = json.toInt();
}
inline void fromValue(const QJsonValue& json, bool& value)
{
    value = json.toBool();
}
inline void fromValue(const QJsonValue& json, std::wstring& value)
{
    value = json.toString().toStdWString();
}

// Returns a record of numbers and texts. Fields that are missing in the object are zero or empty.
template <RecordPacking::HasFields Record>
Record fromJson(const QJsonObject& json)
{
    Record record;
    Record::forEachField(record, [&json](auto, const char* field, auto& value) {
        fromValue(json[QLatin1String(field)], value);
    });
    return record;
}

} // namespace JsonRecords

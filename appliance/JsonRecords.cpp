#include "appliance/JsonRecords.h"

#include "messaging/services/TitlerParams.h"

#include <QJsonArray>
#include <QString>

namespace JsonRecords
{

namespace
{

QString text(const std::wstring& wide)
{
    return QString::fromStdWString(wide);
}

std::wstring wide(const QJsonValue& value)
{
    return value.toString().toStdWString();
}

} // namespace

QJsonObject toJson(const APPEventDefine::_tagAPPEvent& record)
{
    return {{"clientId", record.clientId},
            {"lockType", record.lockType},
            {"flag", record.flag},
            {"eventReceiver", record.eventReceiver}};
}

QJsonObject toJson(const FileManagerDefine::tagTitleChangeStatusParam& record)
{
    return {{"clientId", record.clientId}, {"path", text(record.path)}, {"changeType", record.changeType}};
}

QJsonObject toJson(const FileManagerDefine::tagTitlerPathParam& record)
{
    return {{"clientId", record.clientId}, {"path", text(record.path)}};
}

QJsonObject toJson(const FileManagerDefine::tagChangeFolderNameParam& record)
{
    return {
        {"clientId", record.clientId}, {"oldPath", text(record.oldPath)}, {"newPath", text(record.newPath)}};
}

QJsonObject toJson(const MessageDefine::_tagTopWindowParam& record)
{
    return {{"clientId", record.clientId}, {"topWindow", record.topWindow}};
}

QJsonObject toJson(const MessageDefine::_tagMessageParam& record)
{
    return {{"clientId", record.clientId}, {"boxKind", record.boxKind}, {"boxType", record.boxType},
            {"first", text(record.first)}, {"text", text(record.text)}, {"messageId", record.messageId}};
}

QJsonObject toJson(const MessageDefine::_tagCloseParam& record)
{
    return {{"clientId", record.clientId}, {"closeType", record.closeType}, {"messageId", record.messageId}};
}

QJsonObject toJson(const SubCommonDefine::tagFOLDER_TYPE& record)
{
    return {{"type", record.type}, {"path", text(record.path)}};
}

QJsonObject toJson(const SubCommonDefine::tagSoftKeyBoardInitData& record)
{
    return {{"fieldKind", record.fieldKind},
            {"title", text(record.title)},
            {"keyboardType", record.keyboardType},
            {"maxLength", record.maxLength},
            {"text", text(record.text)},
            {"textLength", record.textLength},
            {"selectionStart", record.selectionStart},
            {"selectionEnd", record.selectionEnd},
            {"selectionMode", record.selectionMode},
            {"limitCondition", text(record.limitCondition)},
            {"lastValue", record.lastValue}};
}

QJsonObject toJson(const SubCommonDefine::tagSoftKeyBoardKeyData& record)
{
    return {{"eventType", record.eventType},   {"key", record.key},
            {"modifiers", record.modifiers},   {"text", text(record.text)},
            {"autoRepeat", record.autoRepeat}, {"nativeVirtualKey", record.nativeVirtualKey}};
}

QJsonObject toJson(const SubCommonDefine::taLimitInfo& record)
{
    return {{"text", text(record.text)}, {"secondText", text(record.secondText)}, {"code", record.code}};
}

QJsonObject toJson(const _tagCallBackInfo& record)
{
    return {{"adapterId", static_cast<qint64>(record.adapterId)},
            {"receiverIdentity", static_cast<qint64>(record.receiverIdentity)}};
}

QJsonObject toJson(const _tagNotifyInfo& record)
{
    return {{"adapterId", static_cast<qint64>(record.adapterId)},
            {"receiverIdentity", static_cast<qint64>(record.receiverIdentity)},
            {"clientId", record.clientId}};
}

QJsonObject toJson(const _CALLBACK_TITLER_PARAMTER& record)
{
    QJsonArray paths;
    for (const std::wstring& path : TitlerParams::unpackPaths(record)) {
        paths.append(text(path));
    }
    return {{"type", record.type},
            {"path", text(record.path)},
            {"size", record.size},
            {"count", record.count},
            {"paths", paths}};
}

APPEventDefine::_tagAPPEvent appEvent(const QJsonObject& json)
{
    APPEventDefine::_tagAPPEvent record;
    record.clientId = json["clientId"].toInt();
    record.lockType = json["lockType"].toInt();
    record.flag = json["flag"].toBool();
    record.eventReceiver = json["eventReceiver"].toInt();
    return record;
}

MessageDefine::_tagMessageParam message(const QJsonObject& json)
{
    MessageDefine::_tagMessageParam record;
    record.clientId = json["clientId"].toInt();
    record.boxKind = json["boxKind"].toInt();
    record.boxType = json["boxType"].toInt();
    record.first = wide(json["first"]);
    record.text = wide(json["text"]);
    record.messageId = json["messageId"].toInt();
    return record;
}

SubCommonDefine::tagSoftKeyBoardKeyData key(const QJsonObject& json)
{
    SubCommonDefine::tagSoftKeyBoardKeyData record;
    record.eventType = json["eventType"].toInt();
    record.key = json["key"].toInt();
    record.modifiers = json["modifiers"].toInt();
    record.text = wide(json["text"]);
    record.autoRepeat = json["autoRepeat"].toBool();
    record.nativeVirtualKey = json["nativeVirtualKey"].toInt();
    return record;
}

} // namespace JsonRecords

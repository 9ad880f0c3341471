// The records of the wire as JSON objects, with the fields' own names.
#pragma once

#include "messaging/services/APPEventDefine.h"
#include "messaging/services/FileManagerDefine.h"
#include "messaging/services/MessageDefine.h"
#include "messaging/services/SubCommonDefine.h"
#include "messaging/services/TitlerDefine.h"

#include <QJsonObject>

namespace JsonRecords
{

QJsonObject toJson(const APPEventDefine::_tagAPPEvent& record);
QJsonObject toJson(const FileManagerDefine::tagTitleChangeStatusParam& record);
QJsonObject toJson(const FileManagerDefine::tagTitlerPathParam& record);
QJsonObject toJson(const FileManagerDefine::tagChangeFolderNameParam& record);
QJsonObject toJson(const MessageDefine::_tagTopWindowParam& record);
QJsonObject toJson(const MessageDefine::_tagMessageParam& record);
QJsonObject toJson(const MessageDefine::_tagCloseParam& record);
QJsonObject toJson(const SubCommonDefine::tagFOLDER_TYPE& record);
QJsonObject toJson(const SubCommonDefine::tagSoftKeyBoardInitData& record);
QJsonObject toJson(const SubCommonDefine::tagSoftKeyBoardKeyData& record);
QJsonObject toJson(const SubCommonDefine::taLimitInfo& record);
QJsonObject toJson(const _tagCallBackInfo& record);
QJsonObject toJson(const _tagNotifyInfo& record);
// With the paths unpacked.
QJsonObject toJson(const _CALLBACK_TITLER_PARAMTER& record);

APPEventDefine::_tagAPPEvent appEvent(const QJsonObject& json);
MessageDefine::_tagMessageParam message(const QJsonObject& json);
SubCommonDefine::tagSoftKeyBoardKeyData key(const QJsonObject& json);

} // namespace JsonRecords

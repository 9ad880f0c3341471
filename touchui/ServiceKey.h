#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <optional>

class QEvent;
class QKeyEvent;

// Converts keys between a field and the keyboard service.
namespace ServiceKey
{

// Returns the record of a key press; nothing for other events.
std::optional<SubCommonDefine::tagSoftKeyBoardKeyData> ofPress(const QEvent* event);
// Returns whether the record is a key press or release. Other records must not be converted to key events.
bool isKey(const SubCommonDefine::tagSoftKeyBoardKeyData& data);
// Returns the event of such a record, not as an auto repeat and with a count of 1.
QKeyEvent toEvent(const SubCommonDefine::tagSoftKeyBoardKeyData& data);
// Returns whether the event is a press or release of Tab, Space, Home, End, a page key or F1 to F12.
bool isSpecial(const QEvent* event);

} // namespace ServiceKey

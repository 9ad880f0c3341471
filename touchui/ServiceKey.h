#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <optional>

class QEvent;
class QKeyEvent;

// The keys that go between a field and the keyboard service.
namespace ServiceKey
{

// The record of a key press; nothing for other events.
std::optional<SubCommonDefine::tagSoftKeyBoardKeyData> ofPress(const QEvent* event);
// Whether the record is of a key press or release: no other event may be made into a key event.
bool isKey(const SubCommonDefine::tagSoftKeyBoardKeyData& data);
// The event of such a record, not repeated and with a count of 1.
QKeyEvent toEvent(const SubCommonDefine::tagSoftKeyBoardKeyData& data);
// Whether the event is a press or release of Tab, Space, Home, End, a page key or F1 to F12.
bool isSpecial(const QEvent* event);

} // namespace ServiceKey

#pragma once

#include "messaging/ptc/WireRecord.h"

// Types of the sub panel process: the folder status and the soft keyboard.
namespace SubCommonDefine
{

// clang-format off

#define tagFOLDER_TYPE_FIELDS(FIELD) \
    FIELD(Int, type, 0) \
    FIELD(Wide, path)

// Describes a text field to the soft keyboard. fieldKind is 1 for a line edit; limitCondition is the pattern
// of the field's validator.
#define tagSoftKeyBoardInitData_FIELDS(FIELD) \
    FIELD(Int32, fieldKind, 0) \
    FIELD(Wide, title) \
    FIELD(Int32, keyboardType, 0) \
    FIELD(Int32, maxLength, 100) \
    FIELD(Wide, text) \
    FIELD(Int32, textLength, 0) \
    FIELD(Int32, selectionStart, 0) \
    FIELD(Int32, selectionEnd, 0) \
    FIELD(Int32, selectionMode, 0) \
    FIELD(Wide, limitCondition) \
    FIELD(Int32, lastValue, 300)

// One key event. eventType is a QEvent::Type, or 1100 when the keyboard was closed.
#define tagSoftKeyBoardKeyData_FIELDS(FIELD) \
    FIELD(Int32, eventType, 0) \
    FIELD(Int32, key, 0) \
    FIELD(Int32, modifiers, 0) \
    FIELD(Wide, text) \
    FIELD(Flag, autoRepeat, false) \
    FIELD(Int32, nativeVirtualKey, 0)

// mode 0 puts the cursor at current, 1 selects from begin to end, 2 selects all.
#define tagSoftKeyBoardKeyTextSelectionPos_FIELDS(FIELD) \
    FIELD(Int32, begin, 0) \
    FIELD(Int32, end, 0) \
    FIELD(Int32, current, 0) \
    FIELD(Int32, mode, 0)

// The reason why an input is refused.
#define taLimitInfo_FIELDS(FIELD) \
    FIELD(Wide, text) \
    FIELD(Wide, secondText) \
    FIELD(Int, code, 0)

// clang-format on
WIRE_RECORD(tagFOLDER_TYPE);
WIRE_RECORD(tagSoftKeyBoardInitData);
WIRE_RECORD(tagSoftKeyBoardKeyData);
WIRE_RECORD(tagSoftKeyBoardKeyTextSelectionPos);
WIRE_RECORD(taLimitInfo);

} // namespace SubCommonDefine

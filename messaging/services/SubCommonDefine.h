// Types of the sub panel process: the folder status and the soft keyboard.
#pragma once

#include <string>

namespace SubCommonDefine
{

// Wire: type (int), path (wide).
struct tagFOLDER_TYPE {
    int type = 0;
    std::wstring path;
};

// Describes a text field to the soft keyboard.
// Wire: int32, wide, int32, int32, wide, int32, int32, int32, int32, wide, int32, in field order.
struct tagSoftKeyBoardInitData {
    int fieldKind = 0; // 1 for a line edit
    std::wstring title;
    int keyboardType = 0;
    int maxLength = 100;
    std::wstring text;
    int textLength = 0;
    int selectionStart = 0;
    int selectionEnd = 0;
    int selectionMode = 0;
    std::wstring limitCondition; // pattern of the field's validator
    int lastValue = 300;
};

// One key event. Wire: int32, int32, int32, wide, bool as int, int32, in field order.
struct tagSoftKeyBoardKeyData {
    int eventType = 0; // QEvent::Type; 1100 tells that the keyboard was closed
    int key = 0;
    int modifiers = 0;
    std::wstring text;
    bool autoRepeat = false;
    int nativeVirtualKey = 0;
};

// Wire: four int32. Mode 0 puts the cursor at current, 1 selects begin to end, 2 selects all.
struct tagSoftKeyBoardKeyTextSelectionPos {
    int begin = 0;
    int end = 0;
    int current = 0;
    int mode = 0;
};

// Why an input is refused. Wire: wide, wide, int.
struct taLimitInfo {
    std::wstring text;
    std::wstring secondText;
    int code = 0;
};

} // namespace SubCommonDefine

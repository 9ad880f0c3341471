// Key presses and releases as the soft keyboard sends them.
#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <QString>

#include <vector>

namespace KeyStrokes
{

// Event type of the key record that tells of the closed keyboard.
constexpr int KEYBOARD_CLOSED = 1100;

// Press and release of a key by its name without "Key_" ("Return", "Left", "Ctrl+Z"), or empty when there is
// none of that name. A single character is no name.
std::vector<SubCommonDefine::tagSoftKeyBoardKeyData> ofName(const QString& name);
// Press and release of each character.
std::vector<SubCommonDefine::tagSoftKeyBoardKeyData> ofText(const QString& text);

} // namespace KeyStrokes

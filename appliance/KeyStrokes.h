#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <QString>

#include <vector>

// Makes key presses and releases as the soft keyboard sends them.
namespace KeyStrokes
{

// Event type of the key record that reports that the keyboard was closed.
constexpr int KEYBOARD_CLOSED = 1100;

// Returns press and release of a key by its name without "Key_" ("Return", "Left", "Ctrl+Z"). Returns an
// empty list for an unknown name and for a single character.
std::vector<SubCommonDefine::tagSoftKeyBoardKeyData> ofName(const QString& name);
// Returns press and release of each character.
std::vector<SubCommonDefine::tagSoftKeyBoardKeyData> ofText(const QString& text);

} // namespace KeyStrokes

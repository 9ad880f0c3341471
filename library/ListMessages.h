// The message boxes of the title library.
#pragma once

#include "messaging/services/MessageDefine.h"

#include <QString>

namespace ListMessages
{

// Titles in one folder.
constexpr int TITLE_LIMIT = 99;
// Templates of the operator's own.
constexpr int TEMPLATE_LIMIT = 998;

// Posts the message, with the text when there is one. Without a message service it is lost. GUI thread.
void post(MessageDef::Message_ID id, const QString& text = QString());
QString limitText();

} // namespace ListMessages

#pragma once

#include "messaging/services/MessageDefine.h"

#include <QString>

// The message boxes of the title library.
namespace ListMessages
{

// Limit for the number of titles in a folder.
constexpr int TITLE_LIMIT = 99;
// Limit for the number of user templates.
constexpr int TEMPLATE_LIMIT = 998;

// Posts the message, with the text if it is not empty. Does nothing without a message service. GUI thread.
void post(MessageDef::Message_ID id, const QString& text = QString());
QString limitText();

} // namespace ListMessages

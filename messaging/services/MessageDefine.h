#pragma once

#include "messaging/ptc/WireRecord.h"

#include <QMetaType>

namespace MessageDef
{

// Numbers of the messages that this program posts; the message service has the texts.
enum Message_ID : int {
    MESSAGE_DELETE_TEMPLATE = 43,
    MESSAGE_RENAME_FAILED = 47,
    MESSAGE_FOLDER_EXISTS = 96,
    MESSAGE_FONT_MISSING = 109,
    MESSAGE_TEXT_OBJECT_LIMIT = 110,
    MESSAGE_SIZE_INVALID = 111,
    MESSAGE_LIST_FULL_ON_CREATE = 112,
    MESSAGE_LIST_FULL_ON_PASTE = 113,
    MESSAGE_DISK_FULL_ON_CREATE = 114,
    MESSAGE_DISK_FULL_ON_DUPLICATE = 115,
    MESSAGE_DISK_FULL_ON_PASTE = 116,
    MESSAGE_CONFIRM_CLOSE = 117,
    MESSAGE_TEMPLATE_LIST_FULL = 196,
    MESSAGE_DISK_FULL_ON_TEMPLATE = 197,
};

} // namespace MessageDef

// Types of the message service, which shows the numbered message boxes of the appliance.
namespace MessageDefine
{

using _emBoxType = int;

// The button that closed a box. Boxes with one button answer with CLOSE_CANCEL.
enum _emCloseType : int { CLOSE_CANCEL = 1, CLOSE_OK = 2 };

// The window in front of the operator.
enum _emTopWindow : int { TOP_WINDOW_TITLER = 1, TOP_WINDOW_MAIN = 2 };

// clang-format off

#define _tagTopWindowParam_FIELDS(FIELD) \
    FIELD(Int, clientId, -1) \
    FIELD(Int, topWindow, 0)

#define _tagMessageParam_FIELDS(FIELD) \
    FIELD(Int, clientId, -1) \
    FIELD(Int, boxKind, 2) \
    FIELD(Int, boxType, -1) \
    FIELD(Wide, first) \
    FIELD(Wide, text) \
    FIELD(Int, messageId, 0)

#define _tagCloseParam_FIELDS(FIELD) \
    FIELD(Int, clientId, -1) \
    FIELD(Int, closeType, 0) \
    FIELD(Int, messageId, 0)

// clang-format on
WIRE_RECORD(_tagTopWindowParam);
WIRE_RECORD(_tagMessageParam);
WIRE_RECORD(_tagCloseParam);
using tagCloseParam = _tagCloseParam;

} // namespace MessageDefine

Q_DECLARE_METATYPE(MessageDefine::_tagCloseParam)
Q_DECLARE_METATYPE(MessageDefine::_tagMessageParam)

// Types of the message service, which shows the numbered message boxes of the appliance.
#pragma once

#include <QMetaType>
#include <string>

namespace MessageDef
{

// Numbers of the messages that this program posts; their texts live in the message service.
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

namespace MessageDefine
{

using _emBoxType = int;

// Which button ended a box. Boxes with one button answer with CLOSE_CANCEL.
enum _emCloseType : int { CLOSE_CANCEL = 1, CLOSE_OK = 2 };

// Who is in front of the operator.
enum _emTopWindow : int { TOP_WINDOW_TITLER = 1, TOP_WINDOW_MAIN = 2 };

// Wire: client id, top window; ints.
struct _tagTopWindowParam {
    int clientId = -1;
    int topWindow = 0;
};

// Wire: client id, box kind, box type (ints), first string, text (wide), message id (int).
struct _tagMessageParam {
    int clientId = -1;
    int boxKind = 2;
    int boxType = -1;
    std::wstring first;
    std::wstring text;
    int messageId = 0;
};

// Wire: client id, close type, message id; ints.
struct _tagCloseParam {
    int clientId = -1;
    int closeType = 0;
    int messageId = 0;
};
using tagCloseParam = _tagCloseParam;

} // namespace MessageDefine

Q_DECLARE_METATYPE(MessageDefine::_tagCloseParam)
Q_DECLARE_METATYPE(MessageDefine::_tagMessageParam)

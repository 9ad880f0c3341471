// Types of the touch lock announcements that the appliance's processes exchange.
#pragma once

#include <QMetaType>

namespace APPEventDefine
{

enum LOCKTYPE : int {
    LOCKTYPE_NONE = 0,
    LOCKTYPE_TOUCH = 1,  // this process holds the touch lock
    LOCKTYPE_OBJECT = 2, // a transient control or a remembered object is in use
};

// Who sent an event; 3 is this program, which ignores its own echo.
enum EventRevicer : int { EVENTREVICER_NONE = 0, EVENTREVICER_TITLER = 3, EVENTREVICER_RESTORE_ALL = 4 };

// Wire: client id (int32), lock type (int32), flag (bool as int), event receiver (int).
struct _tagAPPEvent {
    int clientId = -1;
    int lockType = LOCKTYPE_NONE;
    bool flag = false;
    int eventReceiver = EVENTREVICER_NONE;
};
using tagAPPEvent = _tagAPPEvent;

} // namespace APPEventDefine

Q_DECLARE_METATYPE(APPEventDefine::_tagAPPEvent)

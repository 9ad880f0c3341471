#pragma once

#include "messaging/ptc/WireRecord.h"

#include <QMetaType>

// Types of the touch lock announcements that the appliance's processes exchange.
namespace APPEventDefine
{

enum LOCKTYPE : int {
    LOCKTYPE_NONE = 0,
    LOCKTYPE_TOUCH = 1,  // the sending process holds the touch lock
    LOCKTYPE_OBJECT = 2, // a transient control or a remembered object is in use
};

// Identifies the sender of an event. The titler ignores events from itself.
enum EventRevicer : int { EVENTREVICER_NONE = 0, EVENTREVICER_TITLER = 3, EVENTREVICER_RESTORE_ALL = 4 };

// clang-format off
#define _tagAPPEvent_FIELDS(FIELD) \
    FIELD(Int32, clientId, -1) \
    FIELD(Int32, lockType, LOCKTYPE_NONE) \
    FIELD(Flag, flag, false) \
    FIELD(Int, eventReceiver, EVENTREVICER_NONE)
// clang-format on
WIRE_RECORD(_tagAPPEvent);
using tagAPPEvent = _tagAPPEvent;

} // namespace APPEventDefine

Q_DECLARE_METATYPE(APPEventDefine::_tagAPPEvent)

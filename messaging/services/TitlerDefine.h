// Records of the service that this program offers, of its callback, and of all registrations.
#pragma once

#include "messaging/ptc/WireRecord.h"

// Identifies the caller. The value is stored and returned unchanged; its meaning belongs to the callers.
using _CALL_TITLER_TYPE = int;

// clang-format off

#define _SHOW_TITLER_PARAMTER_FIELDS(FIELD) \
    FIELD(Int, type, 0) \
    FIELD(Wide, path)

#define _tagCallBackInfo_FIELDS(FIELD) \
    FIELD(Id, adapterId, -1) \
    FIELD(Id, receiverIdentity, -1)

#define _tagNotifyInfo_FIELDS(FIELD) \
    FIELD(Id, adapterId, -1) \
    FIELD(Id, receiverIdentity, -1) \
    FIELD(Int32, clientId, -1)

// clang-format on
WIRE_RECORD(_SHOW_TITLER_PARAMTER);
WIRE_RECORD(_tagCallBackInfo);
WIRE_RECORD(_tagNotifyInfo);

// The result of a create session. On the wire: type (int), path (wide), data (raw, size bytes), size (int),
// count (int). data contains the packed paths of the titles that were made, see TitlerParams::packPaths, and
// is owned by the sender.
struct _CALLBACK_TITLER_PARAMTER {
    _CALL_TITLER_TYPE type = 0;
    std::wstring path;
    unsigned char* data = nullptr;
    int size = 0;
    int count = 0;
};

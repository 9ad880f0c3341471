// Events of the service APPEventFilter, implemented by its client. Called in the GUI thread.
#pragma once

#include "messaging/services/APPEventDefine.h"

class IAPPEventFilterNotify
{
public:
    virtual ~IAPPEventFilterNotify() = default;

    virtual void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent event) = 0;
    virtual void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent event) = 0;
    virtual void postRestoreFocusNotify() = 0;
};

// Whom to tell of the events, and the client id that the service gave. target stays the caller's.
struct _tagAPPEventFilterNotify {
    IAPPEventFilterNotify* target = nullptr;
    int clientId = -1;
};

// Events of the service MessageCenter, implemented by its client. Called in the GUI thread.
#pragma once

#include "messaging/services/MessageDefine.h"

class IMessageCenterNotify
{
public:
    virtual ~IMessageCenterNotify() = default;

    virtual void getTopWindowNotify(int topWindow) = 0;
    virtual void postMessageNotify(MessageDefine::_tagMessageParam param) = 0;
    virtual void closeMessageNotify(MessageDefine::_tagCloseParam param) = 0;
    virtual void showBarNotify(int bar) = 0;
};

// Whom to tell of the events, and the client id that the service gave. target stays the caller's.
struct _tagMessageCenterNotify {
    IMessageCenterNotify* target = nullptr;
    int clientId = -1;
};

// Events of the service PowerManager, implemented by its client. Called in the GUI thread.
#pragma once

class IPowerManagerNotify
{
public:
    virtual ~IPowerManagerNotify() = default;

    virtual void powerOff() = 0;
    virtual void powerOn() = 0;
};

// Whom to tell of the events, and the client id that the service gave. target stays the caller's.
struct _tagPowerManagerNotify {
    IPowerManagerNotify* target = nullptr;
    int clientId = -1;
};

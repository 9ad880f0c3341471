// Events of the service ProjectDataManager, implemented by its client. Called in the GUI thread.
#pragma once

class IProjectDataManagerNotify
{
public:
    virtual ~IProjectDataManagerNotify() = default;

    virtual void loadNotify(int state) = 0;
};

// Whom to tell of the events, and the client id that the service gave. target stays the caller's.
struct _tagProjectDataManagerNotify {
    IProjectDataManagerNotify* target = nullptr;
    int clientId = -1;
};

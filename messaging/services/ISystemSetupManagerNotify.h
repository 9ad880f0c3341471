// Events of the service SystemSetupManager, implemented by its client. Called in the GUI thread.
#pragma once

class ISystemSetupManagerNotify
{
public:
    virtual ~ISystemSetupManagerNotify() = default;

    virtual void setSystemLanguageNotify(int language) = 0;
    virtual void setInputLanguageNotify(int language) = 0;
};

// Whom to tell of the events, and the client id that the service gave. target stays the caller's.
struct _tagSystemSetupManagerNotify {
    ISystemSetupManagerNotify* target = nullptr;
    int clientId = -1;
};

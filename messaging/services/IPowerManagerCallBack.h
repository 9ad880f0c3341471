// Answers of the service PowerManager, implemented by its client. Called in the GUI thread.
#pragma once

class IPowerManagerCallBack
{
public:
    virtual ~IPowerManagerCallBack() = default;

    virtual void getClientID(int clientId) = 0;
};

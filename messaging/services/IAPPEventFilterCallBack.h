// Answers of the service APPEventFilter, implemented by its client. Called in the GUI thread.
#pragma once

class IAPPEventFilterCallBack
{
public:
    virtual ~IAPPEventFilterCallBack() = default;

    virtual void setClientID(int clientId) = 0;
};

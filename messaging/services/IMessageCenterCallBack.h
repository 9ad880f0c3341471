// Answers of the service MessageCenter, implemented by its client. Called in the GUI thread.
#pragma once

class IMessageCenterCallBack
{
public:
    virtual ~IMessageCenterCallBack() = default;

    virtual void setClientID(int clientId) = 0;
    virtual void getTopWindowCallBack(int topWindow) = 0;
};

// Answers of the service ProjectDataManager, implemented by its client. Called in the GUI thread.
#pragma once

class IProjectDataManagerCallBack
{
public:
    virtual ~IProjectDataManagerCallBack() = default;

    virtual void getClientID(int clientId) = 0;
};

// Answers of the service FileManagerController, implemented by its client. Called in the GUI thread.
#pragma once

class IFileManagerControllerCallBack
{
public:
    virtual ~IFileManagerControllerCallBack() = default;

    virtual void getClientID(int clientId) = 0;
};

// Answers of the service SystemSetupManager, implemented by its client. Called in the GUI thread.
#pragma once

#include "messaging/services/SystemSetupDef.h"

class ISystemSetupManagerCallBack
{
public:
    virtual ~ISystemSetupManagerCallBack() = default;

    virtual void getClientID(int clientId) = 0;
    virtual void getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam language) = 0;
    virtual void getInformationCallBack(SystemSetupDef::tagSystemInformation information) = 0;
};

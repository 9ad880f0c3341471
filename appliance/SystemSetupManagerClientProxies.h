// The service side of SystemSetupManager: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/ISystemSetupManagerCallBack.h"
#include "messaging/services/ISystemSetupManagerNotify.h"

class SystemSetupManagerCallBackRemoteProxy : public ISystemSetupManagerCallBack, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit SystemSetupManagerCallBackRemoteProxy(long id);

    void getClientID(int clientId) override;
    void getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam language) override;
    void getInformationCallBack(SystemSetupDef::tagSystemInformation information) override;
};

class SystemSetupManagerNotifyRemoteProxy : public ISystemSetupManagerNotify, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit SystemSetupManagerNotifyRemoteProxy(long id);

    void setSystemLanguageNotify(int language) override;
    void setInputLanguageNotify(int language) override;
};

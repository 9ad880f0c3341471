// The service that knows the appliance's languages and model.
//
// Calls are one-way and run in the caller's thread; answers come as calls on ISystemSetupManagerCallBack,
// events as calls on ISystemSetupManagerNotify. Targets stay the caller's.
#pragma once

class ISystemSetupManagerCallBack;
struct _tagSystemSetupManagerNotify;

class ISystemSetupManager
{
public:
    virtual ~ISystemSetupManager() = default;

    virtual void getLanguageInfo(int clientId) = 0;
    virtual void getInformation(int clientId) = 0;
    virtual void unregisterCallBack(int clientId) = 0;
    virtual void unregisterNotifyCallBack(int clientId) = 0;
    virtual void registerCallBack(ISystemSetupManagerCallBack* target) = 0;
    virtual void registerNotifyCallBack(_tagSystemSetupManagerNotify notify) = 0;
};

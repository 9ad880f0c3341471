// The service that tells when a project is loaded.
//
// Calls are one-way and run in the caller's thread; answers come as calls on IProjectDataManagerCallBack,
// events as calls on IProjectDataManagerNotify. Targets stay the caller's.
#pragma once

class IProjectDataManagerCallBack;
struct _tagProjectDataManagerNotify;

class IProjectDataManager
{
public:
    virtual ~IProjectDataManager() = default;

    virtual void unregisterCallBack(int clientId) = 0;
    virtual void unregisterNotifyCallBack(int clientId) = 0;
    virtual void registerCallBack(IProjectDataManagerCallBack* target) = 0;
    virtual void registerNotifyCallBack(_tagProjectDataManagerNotify notify) = 0;
};

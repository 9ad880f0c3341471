// The service that tells when the appliance goes down or comes up.
//
// Calls are one-way and run in the caller's thread; answers come as calls on IPowerManagerCallBack,
// events as calls on IPowerManagerNotify. Targets stay the caller's.
#pragma once

class IPowerManagerCallBack;
struct _tagPowerManagerNotify;

class IPowerManager
{
public:
    virtual ~IPowerManager() = default;

    virtual void closeClient(int clientId) = 0;
    virtual void unregisterCallBack(int clientId) = 0;
    virtual void unregisterNotify(int clientId) = 0;
    virtual void inProcessing() = 0;
    virtual void powerOff() = 0;
    virtual void willPowerOff() = 0;
    virtual void registerCallBack(IPowerManagerCallBack* target) = 0;
    virtual void registerNotify(_tagPowerManagerNotify notify) = 0;
};

// The service side of PowerManager: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/IPowerManagerCallBack.h"
#include "messaging/services/IPowerManagerNotify.h"

class PowerManagerCallBackRemoteProxy : public IPowerManagerCallBack, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit PowerManagerCallBackRemoteProxy(long id);

    void getClientID(int clientId) override;
};

class PowerManagerNotifyRemoteProxy : public IPowerManagerNotify, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit PowerManagerNotifyRemoteProxy(long id);

    void powerOff() override;
    void powerOn() override;
};

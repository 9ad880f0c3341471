// The service side of APPEventFilter: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/IAPPEventFilterCallBack.h"
#include "messaging/services/IAPPEventFilterNotify.h"

class APPEventFilterCallBackRemoteProxy : public IAPPEventFilterCallBack, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit APPEventFilterCallBackRemoteProxy(long id);

    void setClientID(int clientId) override;
};

class APPEventFilterNotifyRemoteProxy : public IAPPEventFilterNotify, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit APPEventFilterNotifyRemoteProxy(long id);

    void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreFocusNotify() override;
};

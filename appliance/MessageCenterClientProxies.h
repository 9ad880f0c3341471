// The service side of MessageCenter: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/IMessageCenterCallBack.h"
#include "messaging/services/IMessageCenterNotify.h"

class MessageCenterCallBackRemoteProxy : public IMessageCenterCallBack, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit MessageCenterCallBackRemoteProxy(long id);

    void setClientID(int clientId) override;
    void getTopWindowCallBack(int topWindow) override;
};

class MessageCenterNotifyRemoteProxy : public IMessageCenterNotify, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit MessageCenterNotifyRemoteProxy(long id);

    void getTopWindowNotify(int topWindow) override;
    void postMessageNotify(MessageDefine::_tagMessageParam param) override;
    void closeMessageNotify(MessageDefine::_tagCloseParam param) override;
    void showBarNotify(int bar) override;
};

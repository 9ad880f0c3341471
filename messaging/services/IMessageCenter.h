// The service that shows the numbered message boxes.
//
// Calls are one-way and run in the caller's thread; answers come as calls on IMessageCenterCallBack,
// events as calls on IMessageCenterNotify. Targets stay the caller's.
#pragma once

#include "messaging/services/MessageDefine.h"

class IMessageCenterCallBack;
struct _tagMessageCenterNotify;

class IMessageCenter
{
public:
    virtual ~IMessageCenter() = default;

    virtual void setTopWindow(MessageDefine::_tagTopWindowParam param) = 0;
    virtual void getTopWindow(int clientId) = 0;
    virtual void postMessage(MessageDefine::_tagMessageParam param) = 0;
    virtual void closeMessage(MessageDefine::_tagCloseParam param) = 0;
    virtual void showBar(int bar) = 0;
    virtual void unregisterCallBack(int clientId) = 0;
    virtual void unregisterNotify(int clientId) = 0;
    virtual void registerCallBack(IMessageCenterCallBack* target) = 0;
    virtual void registerNotify(_tagMessageCenterNotify notify) = 0;
};

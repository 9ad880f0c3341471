// The service that announces touch locks to the other processes.
//
// Calls are one-way and run in the caller's thread; answers come as calls on IAPPEventFilterCallBack,
// events as calls on IAPPEventFilterNotify. Targets stay the caller's.
#pragma once

#include "messaging/services/APPEventDefine.h"

class IAPPEventFilterCallBack;
struct _tagAPPEventFilterNotify;

class IAPPEventFilter
{
public:
    virtual ~IAPPEventFilter() = default;

    virtual void postAPPEventFilter(APPEventDefine::_tagAPPEvent event) = 0;
    virtual void postRestoreOriginal(APPEventDefine::_tagAPPEvent event) = 0;
    virtual void postRestoreFocus() = 0;
    virtual void unregisterCallBack(int clientId) = 0;
    virtual void unregisterNotify(int clientId) = 0;
    virtual void registerCallBack(IAPPEventFilterCallBack* target) = 0;
    virtual void registerNotify(_tagAPPEventFilterNotify notify) = 0;
};

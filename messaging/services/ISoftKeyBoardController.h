// The service that shows the soft keyboard and sends what is typed on it.
//
// Calls are one-way and run in the caller's thread; answers come as calls on ISoftKeyBoardControllerCallBack.
// Targets stay the caller's.
#pragma once

#include "messaging/services/SubCommonDefine.h"

class ISoftKeyBoardControllerCallBack;

class ISoftKeyBoardController
{
public:
    virtual ~ISoftKeyBoardController() = default;

    virtual void show(SubCommonDefine::tagSoftKeyBoardInitData data) = 0;
    virtual void close() = 0;
    virtual void dummyClose() = 0;
    virtual void simpleClose() = 0;
    virtual void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key) = 0;
    virtual void sendLimitInfo(SubCommonDefine::taLimitInfo info) = 0;
    virtual void closeLimitBalloon() = 0;
    virtual void registerCallBack(ISoftKeyBoardControllerCallBack* target) = 0;
    virtual void showMask() = 0;
    virtual void hideMask() = 0;
    // False when the service is known to be gone: what is sent to it now is lost.
    virtual bool isReachable() const { return true; }
};

// Unpacks the answers of the service APPEventFilter and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IAPPEventFilterCallBack;

class APPEventFilterCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_setClientID = 1,
    };

    explicit APPEventFilterCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IAPPEventFilterCallBack*; not owned.
    void setTarget(void* target) override;

private:
    IAPPEventFilterCallBack* m_target = nullptr;
};

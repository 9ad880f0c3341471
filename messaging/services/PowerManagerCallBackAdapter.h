// Unpacks the answers of the service PowerManager and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IPowerManagerCallBack;

class PowerManagerCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_getClientID = 1,
    };

    explicit PowerManagerCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IPowerManagerCallBack*; not owned.
    void setTarget(void* target) override;

private:
    IPowerManagerCallBack* m_target = nullptr;
};

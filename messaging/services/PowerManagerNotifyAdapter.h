// Unpacks the events of the service PowerManager and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IPowerManagerNotify;

class PowerManagerNotifyAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_powerOff = 1,
        METHOD_powerOn = 2,
    };

    explicit PowerManagerNotifyAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IPowerManagerNotify*; not owned.
    void setTarget(void* target) override;

private:
    IPowerManagerNotify* m_target = nullptr;
};

// Unpacks the events of the service SystemSetupManager and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class ISystemSetupManagerNotify;

class SystemSetupManagerNotifyAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_setSystemLanguageNotify = 1,
        METHOD_setInputLanguageNotify = 2,
    };

    explicit SystemSetupManagerNotifyAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an ISystemSetupManagerNotify*; not owned.
    void setTarget(void* target) override;

private:
    ISystemSetupManagerNotify* m_target = nullptr;
};

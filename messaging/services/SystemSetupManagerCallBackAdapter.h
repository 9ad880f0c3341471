// Unpacks the answers of the service SystemSetupManager and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class ISystemSetupManagerCallBack;

class SystemSetupManagerCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_getClientID = 1,
        METHOD_getLanguageInfoCallBack = 2,
        METHOD_getInformationCallBack = 3,
    };

    explicit SystemSetupManagerCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an ISystemSetupManagerCallBack*; not owned.
    void setTarget(void* target) override;

private:
    ISystemSetupManagerCallBack* m_target = nullptr;
};

// Unpacks the answers of the service ProjectDataManager and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IProjectDataManagerCallBack;

class ProjectDataManagerCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_getClientID = 1,
    };

    explicit ProjectDataManagerCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IProjectDataManagerCallBack*; not owned.
    void setTarget(void* target) override;

private:
    IProjectDataManagerCallBack* m_target = nullptr;
};

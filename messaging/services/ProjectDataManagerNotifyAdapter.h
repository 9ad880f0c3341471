// Unpacks the events of the service ProjectDataManager and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IProjectDataManagerNotify;

class ProjectDataManagerNotifyAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_loadNotify = 1,
    };

    explicit ProjectDataManagerNotifyAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IProjectDataManagerNotify*; not owned.
    void setTarget(void* target) override;

private:
    IProjectDataManagerNotify* m_target = nullptr;
};

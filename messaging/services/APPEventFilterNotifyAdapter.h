// Unpacks the events of the service APPEventFilter and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IAPPEventFilterNotify;

class APPEventFilterNotifyAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_postAPPEventFilterNotify = 1,
        METHOD_postRestoreOriginalNotify = 2,
        METHOD_postRestoreFocusNotify = 3,
    };

    explicit APPEventFilterNotifyAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IAPPEventFilterNotify*; not owned.
    void setTarget(void* target) override;

private:
    IAPPEventFilterNotify* m_target = nullptr;
};

// Unpacks the events of the service MessageCenter and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IMessageCenterNotify;

class MessageCenterNotifyAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_getTopWindowNotify = 1,
        METHOD_postMessageNotify = 2,
        METHOD_closeMessageNotify = 3,
        METHOD_showBarNotify = 4,
    };

    explicit MessageCenterNotifyAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IMessageCenterNotify*; not owned.
    void setTarget(void* target) override;

private:
    IMessageCenterNotify* m_target = nullptr;
};

// Unpacks the answers of the service MessageCenter and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IMessageCenterCallBack;

class MessageCenterCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_setClientID = 1,
        METHOD_getTopWindowCallBack = 2,
    };

    explicit MessageCenterCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IMessageCenterCallBack*; not owned.
    void setTarget(void* target) override;

private:
    IMessageCenterCallBack* m_target = nullptr;
};

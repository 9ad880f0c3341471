// Takes packets from other processes and hands them to the receivers of this one.
#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class IReceiver;

class IRemoteReceiver : public IObject
{
public:
    // Starts to listen as the process with that client number. False when it cannot.
    virtual bool initialize(long identity) = 0;
    // The client number, -1 before initialize.
    virtual long getIdentity() = 0;
    // Takes the receiver over.
    virtual void addReceiver(IReceiver* receiver) = 0;
};

} // namespace PTC

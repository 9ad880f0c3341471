#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class IReceiver;

// Receives packets from other processes and passes them to the receivers of this process.
class IRemoteReceiver : public IObject
{
public:
    // Starts to listen as the process with that client number. Returns false on failure.
    virtual bool initialize(long identity) = 0;
    // Returns the client number, or -1 before initialize.
    virtual long getIdentity() = 0;
    // Takes ownership of the receiver.
    virtual void addReceiver(IReceiver* receiver) = 0;
};

} // namespace PTC

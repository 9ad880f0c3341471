#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class Event;
class IAdapterBase;

// Receives the events of one receiver id and owns their adapters.
class IReceiver : public IObject
{
public:
    // Takes ownership of the event and of its data, which was allocated with new[].
    virtual void recv(Event* event) = 0;
    // Both take ownership of the adapter. An adapter whose id is already in use receives no events, but is
    // kept until the receiver is destroyed.
    virtual void addAdapter(IAdapterBase* adapter) = 0;
    virtual void addCBAdapter(IAdapterBase* adapter) = 0;
    // Deletes the callback adapter with that id.
    virtual void removeCBAdapter(long id) = 0;
    // After this call, recv drops events instead of blocking the sender, and threads that are blocked in recv
    // return. Any thread.
    virtual void stopReceiving() {}
};

} // namespace PTC

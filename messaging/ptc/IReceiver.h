// Takes the events of one receiver id and owns the adapters they are for.
#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class Event;
class IAdapterBase;

class IReceiver : public IObject
{
public:
    // Takes the event and its data over; the data was allocated with array new.
    virtual void recv(Event* event) = 0;
    // Both take the adapter over. An adapter whose id is taken never gets an event, and lives as long as the
    // receiver.
    virtual void addAdapter(IAdapterBase* adapter) = 0;
    virtual void addCBAdapter(IAdapterBase* adapter) = 0;
    // Deletes the callback adapter with that id.
    virtual void removeCBAdapter(long id) = 0;
    // From here on recv drops its events where it would hold their sender up, and nobody waits in it. Any
    // thread.
    virtual void stopReceiving() {}
};

} // namespace PTC

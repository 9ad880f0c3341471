// What a receiver hands its events to: an adapter unpacks the arguments and calls its target.
#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class Event;
class IProxyFactory;

class IAdapterBase : public IObject
{
public:
    // Unpacks the event and calls the target. Unknown method ids do nothing. The event stays the caller's.
    virtual void receive(Event* event) = 0;
    // Takes a pointer to the interface that the adapter serves, as void*. Not owned.
    virtual void setTarget(void* target) = 0;
};

class IAdapter : public IAdapterBase
{
public:
    // Makes the proxies of the callbacks that peers register. Not owned.
    virtual void setProxyFactory(IProxyFactory* factory) = 0;
};

} // namespace PTC

#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class Event;
class IProxyFactory;

// Receives the events of one object: unpacks the arguments and calls the target.
class IAdapterBase : public IObject
{
public:
    // Unpacks the event and calls the target; ignores unknown method ids. The caller keeps the event.
    virtual void receive(Event* event) = 0;
    // Sets the target: a pointer to the interface that the adapter serves, as void*. Not owned.
    virtual void setTarget(void* target) = 0;
};

// An adapter that makes proxies for the callbacks that peers register.
class IAdapter : public IAdapterBase
{
public:
    // Sets the factory of the proxies for callbacks that peers register. Not owned.
    virtual void setProxyFactory(IProxyFactory* factory) = 0;
};

} // namespace PTC

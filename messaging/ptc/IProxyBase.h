#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class IAdapterFactory;
class IReceiver;
class ISender;

// Represents an object in another process: packs the arguments of a call and passes them to a sender.
class IProxyBase : public IObject
{
public:
    // Sets the sender, which is required before the first call. Not owned.
    virtual void setSender(ISender* sender) = 0;
};

// A proxy that registers callbacks: it makes their adapters and has them served by a receiver.
class IProxy : public IProxyBase
{
public:
    // Set the objects that are needed to register callbacks. Not owned.
    virtual void setAdapterFactory(IAdapterFactory* factory) = 0;
    virtual void setReceiver(IReceiver* receiver) = 0;
};

} // namespace PTC

// Stands for an object in another process: packs the arguments of a call and hands them to a sender.
#pragma once

#include "messaging/ptc/IObject.h"

namespace PTC
{

class IAdapterFactory;
class IReceiver;
class ISender;

class IProxyBase : public IObject
{
public:
    // Not owned; must be set before the first call.
    virtual void setSender(ISender* sender) = 0;
};

class IProxy : public IProxyBase
{
public:
    // Both serve to register callbacks. Not owned.
    virtual void setAdapterFactory(IAdapterFactory* factory) = 0;
    virtual void setReceiver(IReceiver* receiver) = 0;
};

} // namespace PTC

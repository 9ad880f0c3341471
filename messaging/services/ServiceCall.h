// What every generated proxy method does after packing.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"

namespace PTC
{
class CallbackProxy;
class Proxy;
} // namespace PTC

namespace ServiceCall
{

// Sends a call with packed parameters and destroys the buffer.
void invoke(PTC::Proxy& proxy, long methodId, simplebuffer parameters);
void invoke(PTC::CallbackProxy& proxy, long methodId, simplebuffer parameters);
// Sends a call without parameters. It carries 4 zero bytes, because a frame without a payload is not
// dispatched.
void invoke(PTC::Proxy& proxy, long methodId);
void invoke(PTC::CallbackProxy& proxy, long methodId);

// Makes an adapter for target, a pointer to the interface of that adapter type, and tells the service of it.
void registerCallBack(PTC::Proxy& proxy, long methodId, long adapterType, void* target);
void registerNotify(PTC::Proxy& proxy, long methodId, long adapterType, void* target, int clientId);

} // namespace ServiceCall

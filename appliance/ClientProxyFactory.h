// Makes the proxies with which a service calls its clients.
#pragma once

namespace PTC
{
class CallbackProxy;
}

// A new proxy, owned by the caller, for a client's callback or notify adapter of that type. Null for an
// unknown type.
PTC::CallbackProxy* createClientProxy(long adapterType, long id);

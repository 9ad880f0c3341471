#pragma once

namespace PTC
{

class IProxyBase;

// Creates the proxies of callbacks that a peer has registered.
class IProxyFactory
{
public:
    virtual ~IProxyFactory() = default;
    // Returns a proxy of that type, owned by the caller, for the adapter with that id in the process with
    // that client number. Null for an unknown type or if the process cannot be reached.
    virtual IProxyBase* createProxy(long type, long id, long client) = 0;
};

} // namespace PTC

// Makes the proxies of callbacks that a peer has registered.
#pragma once

namespace PTC
{

class IProxyBase;

class IProxyFactory
{
public:
    virtual ~IProxyFactory() = default;
    // A proxy of that type for adapter id of the process with the client number, owned by the caller. Null
    // for an unknown type and for a process that cannot be reached.
    virtual IProxyBase* createProxy(long type, long id, long client) = 0;
};

} // namespace PTC

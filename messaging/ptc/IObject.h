#pragma once

namespace PTC
{

// Root of the interfaces of the remote call framework. The id is that of an interface, an adapter, a receiver
// or a client, depending on the subclass.
class IObject
{
public:
    virtual ~IObject() = default;
    virtual long getId() = 0;
};

} // namespace PTC

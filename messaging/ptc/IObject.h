// Root of the remote call framework's interfaces. Ids name an interface, an adapter object, a receiver or a
// client.
#pragma once

namespace PTC
{

class IObject
{
public:
    virtual ~IObject() = default;
    virtual long getId() = 0;
};

} // namespace PTC

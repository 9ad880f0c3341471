#pragma once

namespace PTC
{

// Creates the proxies of services by interface id.
class IInstanceFactory
{
public:
    virtual ~IInstanceFactory() = default;
    virtual bool initialize() = 0;
    // Stores a pointer to the interface, as void*, in instance. Leaves instance unchanged for an unknown id.
    virtual void createInstance(long id, void** instance) = 0;
};

} // namespace PTC

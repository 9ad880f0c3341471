// Makes the proxies of services by interface id.
#pragma once

namespace PTC
{

class IInstanceFactory
{
public:
    virtual ~IInstanceFactory() = default;
    virtual bool initialize() = 0;
    // Writes a pointer to the interface, as void*, into instance. An unknown id leaves it untouched.
    virtual void createInstance(long id, void** instance) = 0;
};

} // namespace PTC

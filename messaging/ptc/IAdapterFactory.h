// Makes the adapters that take the answers of a service.
#pragma once

namespace PTC
{

class IAdapterBase;
class IReceiver;

class IAdapterFactory
{
public:
    virtual ~IAdapterFactory() = default;
    // A new adapter of that type with a fresh id, given to the receiver, which owns it. target is a pointer
    // to the interface of the type. Null for an unknown type.
    virtual IAdapterBase* createAdapter(long type, IReceiver* receiver, void* target) = 0;
    // The client number of this process, -1 when it does not listen.
    virtual long getRRIdentity() = 0;
};

} // namespace PTC

#pragma once

namespace PTC
{

class IAdapterBase;
class IReceiver;

// Creates the adapters that receive the answers of a service.
class IAdapterFactory
{
public:
    virtual ~IAdapterFactory() = default;
    // Creates an adapter of that type with a new id and adds it to the receiver, which owns it. target points
    // to the interface of the type. Returns null for an unknown type.
    virtual IAdapterBase* createAdapter(long type, IReceiver* receiver, void* target) = 0;
    // Returns the client number of this process, or -1 if it does not listen.
    virtual long getRRIdentity() = 0;
};

} // namespace PTC

// Makes the proxies and adapters of the services that this program calls, by the numbers of the service
// table.
#pragma once

namespace PTC
{
class IAdapterBase;
class Proxy;
} // namespace PTC

namespace ServiceFamilies
{

// A new proxy, owned by the caller, without sender, receiver and factory. Its interface pointer is written to
// instance as void*. Null, with instance untouched, for services without a family here.
PTC::Proxy* createProxy(long interfaceId, void** instance);

// A new callback or notify adapter of that type, owned by the caller, without a target. Null for types
// without a family here.
PTC::IAdapterBase* createAdapter(long adapterType, long id);

} // namespace ServiceFamilies

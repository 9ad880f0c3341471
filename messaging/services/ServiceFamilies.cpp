#include "messaging/services/ServiceFamilies.h"

namespace ServiceFamilies
{

namespace
{

template <typename... Types>
struct TypeList {
};

using Proxies =
    TypeList<APPEventFilterRemoteProxy, FileManagerControllerRemoteProxy, MessageCenterRemoteProxy,
             PowerManagerRemoteProxy, ProjectDataManagerRemoteProxy, ShowTitlerControllerRemoteProxy,
             SoftKeyBoardControllerRemoteProxy, SystemSetupManagerRemoteProxy>;

using Adapters =
    TypeList<APPEventFilterCallBackAdapter, APPEventFilterNotifyAdapter, FileManagerControllerCallBackAdapter,
             FileManagerControllerNotifyAdapter, MessageCenterCallBackAdapter, MessageCenterNotifyAdapter,
             PowerManagerCallBackAdapter, PowerManagerNotifyAdapter, ProjectDataManagerCallBackAdapter,
             ProjectDataManagerNotifyAdapter, ShowTitlerControllerCallBackAdapter,
             SoftKeyBoardControllerCallBackAdapter, SystemSetupManagerCallBackAdapter,
             SystemSetupManagerNotifyAdapter>;

template <typename RemoteProxy>
PTC::Proxy* makeProxy(void** instance)
{
    auto* proxy = new RemoteProxy(RemoteProxy::INTERFACE_ID);
    *instance = static_cast<typename RemoteProxy::Interface*>(proxy);
    return proxy;
}

template <typename... RemoteProxies>
PTC::Proxy* makeProxyOf(TypeList<RemoteProxies...>, long interfaceId, void** instance)
{
    PTC::Proxy* made = nullptr;
    static_cast<void>(
        ((RemoteProxies::INTERFACE_ID == interfaceId && (made = makeProxy<RemoteProxies>(instance))) || ...));
    return made;
}

template <typename... Types>
PTC::IAdapterBase* makeAdapterOf(TypeList<Types...>, long adapterType, long id)
{
    PTC::IAdapterBase* made = nullptr;
    static_cast<void>(((Types::Interface::ADAPTER_TYPE == adapterType && (made = new Types(id))) || ...));
    return made;
}

template <typename... Types>
PTC::CallbackProxy* makeClientProxyOf(TypeList<Types...>, long adapterType, long id)
{
    PTC::CallbackProxy* made = nullptr;
    static_cast<void>(
        ((Types::Interface::ADAPTER_TYPE == adapterType && (made = new typename Types::Peer(id))) || ...));
    return made;
}

} // namespace

PTC::Proxy* createProxy(long interfaceId, void** instance)
{
    return makeProxyOf(Proxies(), interfaceId, instance);
}

PTC::IAdapterBase* createAdapter(long adapterType, long id)
{
    return makeAdapterOf(Adapters(), adapterType, id);
}

PTC::CallbackProxy* createClientProxy(long adapterType, long id)
{
    return makeClientProxyOf(Adapters(), adapterType, id);
}

} // namespace ServiceFamilies

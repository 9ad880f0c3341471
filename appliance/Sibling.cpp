#include "appliance/Sibling.h"

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"
#include "messaging/services/TitlerAdapter.h"

Sibling::Sibling(long client, long key)
    : m_client(client), m_newReceiver(std::make_unique<PTC::QtReceiver>(key)), m_receiver(m_newReceiver.get())
{
}

Sibling::~Sibling() = default;

bool Sibling::initialize()
{
    PTC::InstanceFactory::initialize();
    auto receiver = std::make_unique<SocketRemoteReceiver>(0);
    receiver->addReceiver(m_newReceiver.release());
    const bool listening = receiver->initialize(m_client);
    setRemoteReceiver(receiver.release());
    return listening;
}

void Sibling::addService(const ServiceDescription& service, const ServiceAdapter::Handler& handler)
{
    auto* adapter = new ServiceAdapter(service, handler);
    adapter->setProxyFactory(this);
    m_receiver->addAdapter(adapter);
}

void Sibling::createInstance(long id, void** instance)
{
    SocketRemoteSender* sender =
        id == TitlerAdapter::INTERFACE_ID ? senderTo(ServiceTable::TITLER_CLIENT) : nullptr;
    if (sender == nullptr)
        return;
    auto* proxy = new TitlerRemoteProxy(id);
    proxy->setSender(sender);
    proxy->setAdapterFactory(this);
    proxy->setReceiver(m_receiver);
    *instance = static_cast<ITitler*>(proxy);
}

PTC::IAdapterBase* Sibling::createAdapter(long type, PTC::IReceiver* receiver, void* target)
{
    if (type != TitlerAdapter::CALLBACK_INTERFACE_ID)
        return nullptr;
    auto* adapter = new TitlerCallBackAdapter(++m_lastAdapterId);
    adapter->setTarget(target);
    receiver->addCBAdapter(adapter);
    return adapter;
}

PTC::IProxyBase* Sibling::createProxy(long type, long id, long client)
{
    std::unique_ptr<PTC::CallbackProxy> proxy(ServiceFamilies::createClientProxy(type, id));
    SocketRemoteSender* sender = proxy != nullptr ? senderTo(client) : nullptr;
    if (sender == nullptr)
        return nullptr;
    proxy->setSender(sender);
    return proxy.release();
}

bool Sibling::connectTo(long client)
{
    return senderTo(client) != nullptr;
}

// The sender of a client is kept, because its proxies hold it; a client that was restarted is reached through
// it again.
SocketRemoteSender* Sibling::senderTo(long client)
{
    const long key = ServiceTable::senderKeyOf(client);
    auto* sender = static_cast<SocketRemoteSender*>(findSender(key));
    if (sender != nullptr) {
        const bool usable = sender->getIdentity() == client && sender->isConnected();
        return usable || sender->initialize(client) ? sender : nullptr;
    }
    auto fresh = std::make_unique<SocketRemoteSender>(key);
    if (!fresh->initialize(client))
        return nullptr;
    sender = fresh.release();
    addSender(sender);
    return sender;
}

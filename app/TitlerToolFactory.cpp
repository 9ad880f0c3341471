#include "app/TitlerToolFactory.h"

#include "app/SiblingWait.h"
#include "app/Titler.h"
#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/ptc/Proxy.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"
#include "messaging/services/TitlerAdapter.h"
#include "support/LogManager.h"

#include <functional>
#include <map>
#include <string>

namespace
{

constexpr long SOCKET_RECEIVER_ID = 0;
constexpr unsigned long MINIMUM_ALLOCATION_UNIT = 4;
constexpr int LOG_NUMBER = 200;

} // namespace

TitlerToolFactory::TitlerToolFactory() = default;
TitlerToolFactory::~TitlerToolFactory() = default;

bool TitlerToolFactory::initialize()
{
    PTC::InstanceFactory::initialize();
    CSimpleBuffer::simplebuffer_system_init(MINIMUM_ALLOCATION_UNIT, myMalloc, myFree);

    auto receiver = std::make_unique<PTC::QtReceiver>(TITLER_RECEIVER_ID);
    if (!m_titler)
        m_titler = std::make_unique<Titler>();
    auto* adapter = new TitlerAdapter(TITLER_INTERFACE_ID);
    adapter->setProxyFactory(this);
    adapter->setTarget(m_titler.get());
    receiver->addAdapter(adapter);
    m_receiver = receiver.get();

    // A sibling may send its first request at the moment the port listens: there has to be a receiver by
    // then.
    auto remoteReceiver = std::make_unique<SocketRemoteReceiver>(SOCKET_RECEIVER_ID);
    remoteReceiver->addReceiver(receiver.release());
    if (!remoteReceiver->initialize(TITLER_CLIENT_NUMBER)) {
        m_unboundReceiver = std::move(remoteReceiver);
        return false;
    }
    setRemoteReceiver(remoteReceiver.release());
    return true;
}

PTC::ISender* TitlerToolFactory::serviceSender(long client, long port)
{
    if (PTC::ISender* sender = findSender(client))
        return sender;
    auto sender = std::make_unique<SocketRemoteSender>(client);
    if (!SiblingWait(missingSiblings()).waitFor(*sender, port))
        return nullptr;
    PTC::ISender* added = sender.get();
    addSender(sender.release());
    return added;
}

// Sorted by descending key, which is the order of the start: the sub panel comes first.
std::vector<long> TitlerToolFactory::missingSiblings()
{
    std::map<long, long, std::greater<>> ports;
    for (const ServiceTable::Service& service : ServiceTable::services())
        if (!findSender(service.clientKey))
            ports[service.clientKey] = service.port;
    std::vector<long> missing;
    for (const auto& [key, port] : ports)
        missing.push_back(port);
    return missing;
}

void TitlerToolFactory::createInstance(long id, void** out)
{
    const ServiceTable::Service* service = ServiceTable::findByInterface(id);
    void* instance = nullptr;
    std::unique_ptr<PTC::Proxy> made(ServiceFamilies::createProxy(id, &instance));
    PTC::ISender* sender = service && made ? serviceSender(service->clientKey, service->port) : nullptr;
    if (!sender)
        return;
    PTC::Proxy* proxy = made.get();
    m_proxies.push_back(std::move(made));
    proxy->setAdapterFactory(this);
    proxy->setSender(sender);
    proxy->setReceiver(m_receiver);
    *out = instance;
}

void TitlerToolFactory::RegisterObject(long id, void* object)
{
    if (id == TITLER_INTERFACE_ID && !m_titler)
        m_titler.reset(static_cast<ITitler*>(object));
}

PTC::IAdapterBase* TitlerToolFactory::createAdapter(long type, PTC::IReceiver* receiver, void* target)
{
    PTC::IAdapterBase* adapter = ServiceFamilies::createAdapter(type, m_nextAdapterId);
    if (!adapter)
        return nullptr;
    ++m_nextAdapterId;
    adapter->setTarget(target);
    receiver->addCBAdapter(adapter);
    return adapter;
}

PTC::IProxyBase* TitlerToolFactory::createProxy(long type, long id, long client)
{
    if (type != TITLER_CALLBACK_INTERFACE_ID)
        return nullptr;
    PTC::ISender* sender = ServiceTable::isSibling(client) ? callBackSender(client) : nullptr;
    if (!sender) {
        reportRefusal(client);
        return nullptr;
    }
    m_lastRefusedClient.reset();
    auto* proxy = new TitlerCallBackRemoteProxy(id);
    proxy->setSender(sender);
    return proxy;
}

// Connects again: the process of this key may have been restarted, which makes the old connection useless.
PTC::ISender* TitlerToolFactory::callBackSender(long client)
{
    const long key = ServiceTable::senderKeyOf(client);
    if (PTC::ISender* sender = findSender(key))
        return sender->beginConnect(client) ? sender : nullptr;
    auto sender = std::make_unique<SocketRemoteSender>(key);
    if (!sender->beginConnect(client))
        return nullptr;
    addSender(sender.release());
    return findSender(key);
}

// Logs repeated refusals of a client once.
void TitlerToolFactory::reportRefusal(long client)
{
    if (m_lastRefusedClient == client)
        return;
    m_lastRefusedClient = client;
    LOG_DEBUG_OPERATE(L"TitlerToolFactory", LOG_NUMBER,
                      L"No result will go to client " + std::to_wstring(client) +
                          L": it is unknown or does not listen");
}

#include "app/TitlerToolFactory.h"

#include "app/Titler.h"
#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/ptc/Proxy.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"
#include "messaging/services/TitlerAdapter.h"
#include "messaging/services/TitlerCallBackRemoteProxy.h"

#include <unistd.h>

namespace
{

constexpr long SOCKET_RECEIVER_ID = 0;
constexpr unsigned long MINIMUM_ALLOCATION_UNIT = 4;
constexpr unsigned CONNECT_RETRY_MICROSECONDS = 20000;

} // namespace

TitlerToolFactory::TitlerToolFactory() = default;
TitlerToolFactory::~TitlerToolFactory() = default;

bool TitlerToolFactory::initialize()
{
    PTC::InstanceFactory::initialize();
    CSimpleBuffer::simplebuffer_system_init(MINIMUM_ALLOCATION_UNIT, myMalloc, myFree);

    auto receiver = std::make_unique<PTC::QtReceiver>(TITLER_RECEIVER_ID);
    if (!mTitler)
        mTitler = std::make_unique<Titler>();
    auto* adapter = new TitlerAdapter(TITLER_INTERFACE_ID);
    adapter->setProxyFactory(this);
    adapter->setTarget(mTitler.get());
    receiver->addAdapter(adapter);
    mReceiver = receiver.get();

    auto remoteReceiver = std::make_unique<SocketRemoteReceiver>(SOCKET_RECEIVER_ID);
    if (!remoteReceiver->initialize(TITLER_CLIENT_NUMBER)) {
        mUnboundReceiver = std::move(receiver);
        return false;
    }
    remoteReceiver->addReceiver(receiver.release());
    setRemoteReceiver(remoteReceiver.release());
    return true;
}

PTC::ISender* TitlerToolFactory::serviceSender(long client, long port)
{
    if (PTC::ISender* sender = findSender(client))
        return sender;
    auto sender = std::make_unique<SocketRemoteSender>(client);
    while (!sender->initialize(port))
        ::usleep(CONNECT_RETRY_MICROSECONDS);
    PTC::ISender* added = sender.get();
    addSender(sender.release());
    return added;
}

void TitlerToolFactory::createInstance(long id, void** out)
{
    const ServiceTable::Service* service = ServiceTable::findByInterface(id);
    void* instance = nullptr;
    PTC::Proxy* proxy = ServiceFamilies::createProxy(id, &instance);
    if (!service || !proxy)
        return;
    mProxies.emplace_back(proxy);
    proxy->setAdapterFactory(this);
    proxy->setSender(serviceSender(service->clientKey, service->port));
    proxy->setReceiver(mReceiver);
    *out = instance;
}

void TitlerToolFactory::RegisterObject(long id, void* object)
{
    if (id == TITLER_INTERFACE_ID && !mTitler)
        mTitler.reset(static_cast<ITitler*>(object));
}

PTC::IAdapterBase* TitlerToolFactory::createAdapter(long type, PTC::IReceiver* receiver, void* target)
{
    PTC::IAdapterBase* adapter = ServiceFamilies::createAdapter(type, mNextAdapterId);
    if (!adapter)
        return nullptr;
    ++mNextAdapterId;
    adapter->setTarget(target);
    receiver->addCBAdapter(adapter);
    return adapter;
}

PTC::IProxyBase* TitlerToolFactory::createProxy(long type, long id, long client)
{
    if (type != TITLER_CALLBACK_INTERFACE_ID)
        return nullptr;
    const long key = ServiceTable::senderKeyOf(client);
    PTC::ISender* sender = findSender(key);
    if (!sender) {
        auto connecting = std::make_unique<SocketRemoteSender>(key);
        if (!connecting->initialize(client))
            return nullptr;
        sender = connecting.get();
        addSender(connecting.release());
    } else if (auto* socket = dynamic_cast<SocketRemoteSender*>(sender); socket && !socket->isConnected()) {
        // The process behind the key was started anew and asks for answers: the old connection is of no use.
        if (!socket->initialize(client))
            return nullptr;
    }
    auto* proxy = new TitlerCallBackRemoteProxy(id);
    proxy->setSender(sender);
    return proxy;
}

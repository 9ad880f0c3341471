#include "messaging/ptc/Proxy.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/IAdapterBase.h"
#include "messaging/ptc/IAdapterFactory.h"
#include "messaging/ptc/IReceiver.h"
#include "messaging/ptc/ISender.h"

namespace PTC
{

Proxy::Proxy(int id, bool remote) : m_id(id), m_remote(remote)
{
}

long Proxy::getId()
{
    return m_id;
}

void Proxy::setSender(ISender* sender)
{
    m_sender = sender;
}

void Proxy::setAdapterFactory(IAdapterFactory* factory)
{
    m_adapterFactory = factory;
}

void Proxy::setReceiver(IReceiver* receiver)
{
    m_receiver = receiver;
}

void Proxy::invokeMethod(long methodId, void* data, long size)
{
    m_sender->send(new Event(m_id, methodId, data, size, m_remote, false));
}

long Proxy::createAdapter(long type, void* target)
{
    IAdapterBase* adapter = m_adapterFactory->createAdapter(type, m_receiver, target);
    return adapter != nullptr ? adapter->getId() : -1;
}

void Proxy::destoryAdapter(long id)
{
    m_receiver->removeCBAdapter(id);
}

long Proxy::getRRIdentity()
{
    return m_adapterFactory->getRRIdentity();
}

bool Proxy::isConnected() const
{
    return m_sender != nullptr && m_sender->reconnect();
}

} // namespace PTC

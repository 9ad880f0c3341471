#include "messaging/ptc/Adapter.h"

#include "messaging/ptc/IProxyFactory.h"

namespace PTC
{

Adapter::Adapter(long id) : m_id(id)
{
}

long Adapter::getId()
{
    return m_id;
}

void Adapter::setProxyFactory(IProxyFactory* factory)
{
    m_proxyFactory = factory;
}

IProxyBase* Adapter::createProxy(long type, long id, long client)
{
    return m_proxyFactory != nullptr ? m_proxyFactory->createProxy(type, id, client) : nullptr;
}

} // namespace PTC

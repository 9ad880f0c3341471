#include "messaging/ptc/Receiver.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/IAdapterBase.h"

namespace PTC
{

Receiver::Receiver(long id) : m_id(id)
{
}

Receiver::~Receiver() = default;

long Receiver::getId()
{
    return m_id;
}

void Receiver::recv(Event* event)
{
    const std::unique_ptr<Event> owner(event);
    handleEvent(event);
    delete[] static_cast<char*>(event->getData());
}

void Receiver::addAdapter(IAdapterBase* adapter)
{
    enter(m_adapters, adapter);
}

void Receiver::addCBAdapter(IAdapterBase* adapter)
{
    enter(m_callbackAdapters, adapter);
}

void Receiver::enter(AdapterMap& adapters, IAdapterBase* adapter)
{
    std::unique_ptr<IAdapterBase>& entry = adapters[adapter->getId()];
    if (entry == nullptr)
        entry.reset(adapter);
    else if (entry.get() != adapter)
        m_lostAdapters.emplace_back(adapter);
}

void Receiver::removeCBAdapter(long id)
{
    m_callbackAdapters.erase(id);
}

void Receiver::handleEvent(Event* event)
{
    AdapterMap& adapters = event->isCallback() ? m_callbackAdapters : m_adapters;
    const auto found = adapters.find(event->getObjectId());
    if (found != adapters.end())
        found->second->receive(event);
}

} // namespace PTC

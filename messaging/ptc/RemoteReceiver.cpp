#include "messaging/ptc/RemoteReceiver.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/EventPacket.h"
#include "messaging/ptc/IReceiver.h"

namespace PTC
{

RemoteReceiver::RemoteReceiver(long id) : m_id(id)
{
}

RemoteReceiver::~RemoteReceiver() = default;

long RemoteReceiver::getId()
{
    return m_id;
}

bool RemoteReceiver::initialize(long identity)
{
    m_identity = identity;
    return true;
}

long RemoteReceiver::getIdentity()
{
    return m_identity;
}

void RemoteReceiver::addReceiver(IReceiver* receiver)
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    std::unique_ptr<IReceiver>& entry = m_receivers[receiver->getId()];
    if (entry.get() != receiver)
        entry.reset(receiver);
}

void RemoteReceiver::handleEventPacket(EventPacket* packet)
{
    IReceiver* receiver = findReceiver(packet->receiverId);
    void* data = packet->data;
    packet->data = nullptr;
    if (receiver == nullptr) {
        delete[] static_cast<char*>(data);
        return;
    }
    receiver->recv(
        new Event(packet->objectId, packet->methodId, data, packet->size, packet->remote, packet->callback));
}

void RemoteReceiver::stopReceivers()
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    for (const auto& [id, receiver] : m_receivers)
        receiver->stopReceiving();
}

IReceiver* RemoteReceiver::findReceiver(long id)
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    const auto found = m_receivers.find(id);
    return found != m_receivers.end() ? found->second.get() : nullptr;
}

} // namespace PTC

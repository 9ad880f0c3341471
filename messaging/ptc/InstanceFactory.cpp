#include "messaging/ptc/InstanceFactory.h"

#include "messaging/ptc/IRemoteReceiver.h"
#include "messaging/ptc/ISender.h"

namespace PTC
{

namespace
{

// Limit for sending the last calls to all peers together.
constexpr std::chrono::seconds FINISH_TIME(1);

} // namespace

InstanceFactory::InstanceFactory() = default;

InstanceFactory::~InstanceFactory()
{
    // Stop the receiving threads before anything that their calls may use is destroyed.
    m_remoteReceiver.reset();
    const auto deadline = std::chrono::steady_clock::now() + FINISH_TIME;
    for (const auto& [key, sender] : m_senders)
        sender->finish(deadline);
}

bool InstanceFactory::initialize()
{
    return true;
}

long InstanceFactory::getRRIdentity()
{
    return m_remoteReceiver != nullptr ? m_remoteReceiver->getIdentity() : -1;
}

ISender* InstanceFactory::findSender(long key)
{
    const auto found = m_senders.find(key);
    return found != m_senders.end() ? found->second.get() : nullptr;
}

void InstanceFactory::addSender(ISender* sender)
{
    std::unique_ptr<ISender> owner(sender);
    std::unique_ptr<ISender>& entry = m_senders[sender->getId()];
    if (entry == nullptr || entry.get() == sender) {
        static_cast<void>(entry.release());
        entry = std::move(owner);
    }
}

void InstanceFactory::setRemoteReceiver(IRemoteReceiver* receiver)
{
    m_remoteReceiver.reset(receiver);
}

} // namespace PTC

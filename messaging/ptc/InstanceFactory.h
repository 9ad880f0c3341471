#pragma once

#include "messaging/ptc/IAdapterFactory.h"
#include "messaging/ptc/IInstanceFactory.h"
#include "messaging/ptc/IProxyFactory.h"

#include <map>
#include <memory>

namespace PTC
{

class IRemoteReceiver;
class ISender;

// Owns the remote receiver and the senders of a process.
class InstanceFactory : public IInstanceFactory, public IAdapterFactory, public IProxyFactory
{
public:
    InstanceFactory();
    // Waits at most one second in total until the last calls to all peers are sent.
    ~InstanceFactory() override;
    InstanceFactory(const InstanceFactory&) = delete;
    InstanceFactory& operator=(const InstanceFactory&) = delete;

    // Returns true; subclasses do the work.
    bool initialize() override;
    long getRRIdentity() override;

protected:
    // Returns the sender with that key, or null.
    ISender* findSender(long key);
    // Takes ownership of the sender and registers it under its id. If the id is in use, the existing sender
    // is kept and the new one deleted.
    void addSender(ISender* sender);
    // Takes ownership of the receiver and deletes the previous one. Null is allowed.
    void setRemoteReceiver(IRemoteReceiver* receiver);

private:
    std::unique_ptr<IRemoteReceiver> m_remoteReceiver;
    std::map<long, std::unique_ptr<ISender>> m_senders;
};

} // namespace PTC

// Owner of a process's remote receiver and of its senders.
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

class InstanceFactory : public IInstanceFactory, public IAdapterFactory, public IProxyFactory
{
public:
    InstanceFactory();
    // Gives the last calls to all peers together a second to go out.
    ~InstanceFactory() override;
    InstanceFactory(const InstanceFactory&) = delete;
    InstanceFactory& operator=(const InstanceFactory&) = delete;

    // True; the subclass does the work.
    bool initialize() override;
    long getRRIdentity() override;

protected:
    // The sender with that key, or null.
    ISender* findSender(long key);
    // Takes the sender over under its id. An entry that exists is kept, and the new sender deleted.
    void addSender(ISender* sender);
    // Takes the receiver over; null is allowed and deletes the one before.
    void setRemoteReceiver(IRemoteReceiver* receiver);
    IRemoteReceiver* remoteReceiver();

private:
    std::unique_ptr<IRemoteReceiver> m_remoteReceiver;
    std::map<long, std::unique_ptr<ISender>> m_senders;
};

} // namespace PTC

#pragma once

#include "appliance/ServiceAdapter.h"
#include "messaging/ptc/InstanceFactory.h"

class SocketRemoteSender;

namespace PTC
{
class QtReceiver;
}

// One process of the appliance as the titler sees it: the client number at which it listens, its services,
// and the connection back to the titler.
class Sibling : public PTC::InstanceFactory
{
public:
    // client is the client number, key the receiver id in the frames for this process.
    Sibling(long client, long key);
    ~Sibling() override;

    // Starts to listen. Returns false if the port cannot be bound.
    bool initialize() override;
    // Adds a service. Call before initialize.
    void addService(const ServiceDescription& service, const ServiceAdapter::Handler& handler);

    // Stores the titler's proxy in instance for interface id 117. Leaves instance unchanged for any other id
    // and while the titler does not listen.
    void createInstance(long id, void** instance) override;
    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override;
    PTC::IProxyBase* createProxy(long type, long id, long client) override;

    // Returns whether the process with that client number is connected; if not, tries once to connect.
    bool connectTo(long client);

private:
    SocketRemoteSender* senderTo(long client);

    long m_client;
    std::unique_ptr<PTC::QtReceiver> m_newReceiver; // until the remote receiver takes ownership
    PTC::QtReceiver* m_receiver;
    long m_lastAdapterId = -1;
};

// One process of the appliance as the titler sees it: a client number to listen at, the services that live
// there, and the connection back to the titler.
#pragma once

#include "appliance/ServiceAdapter.h"
#include "messaging/ptc/InstanceFactory.h"

class SocketRemoteSender;

namespace PTC
{
class QtReceiver;
}

class Sibling : public PTC::InstanceFactory
{
public:
    // client is the client number, key the receiver id in the frames that come here.
    Sibling(long client, long key);
    ~Sibling() override;

    // Starts to listen. False when the port cannot be bound.
    bool initialize() override;
    // Offers a service; before initialize.
    void addService(const ServiceDescription& service, const ServiceAdapter::Handler& handler);

    // The titler's proxy for interface id 117; untouched for any other id, and while the titler does not
    // listen.
    void createInstance(long id, void** instance) override;
    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override;
    PTC::IProxyBase* createProxy(long type, long id, long client) override;

    // Whether the process with that client number is connected; tries once when it is not.
    bool connectTo(long client);

private:
    SocketRemoteSender* senderTo(long client);

    long m_client;
    std::unique_ptr<PTC::QtReceiver> m_newReceiver; // until the remote receiver takes it over
    PTC::QtReceiver* m_receiver;
    long m_lastAdapterId = -1;
};

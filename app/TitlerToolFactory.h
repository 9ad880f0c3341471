#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "messaging/ptc/InstanceFactory.h"
#include "messaging/services/ITitler.h"

namespace PTC
{
class IObject;
class IRemoteReceiver;
class ISender;
class Proxy;
class QtReceiver;
} // namespace PTC

// Makes all objects for communication with the sibling processes: the listener on port 1003 with the adapter
// of the service that this program offers, the proxies of the services that it calls, and the adapters of
// their callbacks. Owns the receiver, the senders and the service object; proxies and adapters exist as long
// as the factory.
//
// GUI thread.
class TitlerToolFactory : public PTC::InstanceFactory
{
public:
    static constexpr long TITLER_INTERFACE_ID = ITitler::INTERFACE_ID;
    static constexpr long TITLER_CALLBACK_INTERFACE_ID = ITitlerCallBack::ADAPTER_TYPE;
    // Client number and listening port of this process.
    static constexpr long TITLER_CLIENT_NUMBER = ServiceTable::TITLER_CLIENT;
    static constexpr long TITLER_RECEIVER_ID = ServiceTable::TITLER_CLIENT_KEY;

    TitlerToolFactory();
    ~TitlerToolFactory() override;

    // Starts the listener. Returns false when the port cannot be bound: the factory still makes proxies, but
    // no request reaches this process.
    bool initialize() override;

    // Writes the proxy of a service to *out; leaves *out unchanged for an unknown id. The first call for a
    // sibling blocks, without limit, until the sibling accepts the connection; if this process is told to end
    // meanwhile, *out stays unchanged.
    void createInstance(long id, void** out) override;

    // Takes ownership of an implementation of ITitler, which is used instead of the default one. Only the
    // first object for its id is accepted.
    virtual void RegisterObject(long id, void* object);

    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override;
    // Returns null for a client number that is not that of a sibling, and when nobody listens there; does not
    // wait.
    PTC::IProxyBase* createProxy(long type, long id, long client) override;

    // Calls createInstance() and casts the result to the interface's type.
    template <typename Interface>
    Interface* createService()
    {
        void* instance = nullptr;
        createInstance(Interface::INTERFACE_ID, &instance);
        return static_cast<Interface*>(instance);
    }

private:
    PTC::ISender* serviceSender(long client, long port);
    std::vector<long> missingSiblings();
    PTC::ISender* callBackSender(long client);
    void reportRefusal(long client);

    std::unique_ptr<ITitler> m_titler;
    PTC::QtReceiver* m_receiver = nullptr; // owned by the remote receiver
    std::unique_ptr<PTC::IRemoteReceiver>
        m_unboundReceiver; // the remote receiver when the port could not be bound
    std::vector<std::unique_ptr<PTC::IObject>> m_proxies;
    long m_nextAdapterId = 0;
    std::optional<long> m_lastRefusedClient;
};

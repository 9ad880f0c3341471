// Builds everything that talks to the siblings: the listener on port 1003 with the adapter of the service
// that this program offers, the proxies of the services that it calls, and the callback adapters those need.
// Owns the receiver, the senders and the service object; proxies and adapters live as long as the factory.
//
// GUI thread.
#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "messaging/ptc/InstanceFactory.h"
#include "messaging/services/ITitler.h"

namespace PTC
{
class IObject;
class ISender;
class Proxy;
class QtReceiver;
} // namespace PTC

class TitlerToolFactory : public PTC::InstanceFactory
{
public:
    static constexpr long TITLER_INTERFACE_ID = ITitler::INTERFACE_ID;
    static constexpr long TITLER_CALLBACK_INTERFACE_ID = ITitlerCallBack::ADAPTER_TYPE;
    // Identity and listening port of this process.
    static constexpr long TITLER_CLIENT_NUMBER = ServiceTable::TITLER_CLIENT;
    static constexpr long TITLER_RECEIVER_ID = ServiceTable::TITLER_CLIENT_KEY;

    TitlerToolFactory();
    ~TitlerToolFactory() override;

    // Starts the listener. False when the port cannot be bound; the factory still makes proxies then, but no
    // request reaches this process.
    bool initialize() override;

    // Writes the proxy of a service to *out; an unknown id leaves it untouched. The first of each sibling
    // blocks, without limit, until it accepts the connection; a request to end the process leaves *out
    // untouched.
    void createInstance(long id, void** out) override;

    // Takes over an implementation of ITitler in place of the own one; only for its id, and only the first.
    virtual void RegisterObject(long id, void* object);

    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override;
    // Null for a client number that no sibling has, and when nobody listens there; does not wait.
    PTC::IProxyBase* createProxy(long type, long id, long client) override;

    // createInstance with the interface's type: createInstance hands out the interface pointer as void*.
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

    std::unique_ptr<ITitler> mTitler;
    PTC::QtReceiver* mReceiver = nullptr;              // owned by the remote receiver, which listens
    std::unique_ptr<PTC::QtReceiver> mUnboundReceiver; // owns it instead when nothing listens
    std::vector<std::unique_ptr<PTC::IObject>> mProxies;
    long mNextAdapterId = 0;
    std::optional<long> mLastRefusedClient;
};

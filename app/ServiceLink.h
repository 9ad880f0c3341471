#pragma once

#include "app/EarlyRequests.h"
#include "app/TitlerToolFactory.h"

// The hand-shake with a service of a sibling process, which is the same for all services: the callbacks are
// registered, the service answers with a client id, and the notices are registered with this id. Unregisters
// when it is destroyed, if the client id was received. GUI thread.
template <typename Service>
class ServiceLink
{
public:
    ServiceLink() = default;
    ~ServiceLink();
    ServiceLink(const ServiceLink&) = delete;
    ServiceLink& operator=(const ServiceLink&) = delete;

    // Registers the callbacks. Blocks until the sibling listens. Does nothing if the client id was received
    // before. The callbacks are not owned and must outlive this object.
    template <typename CallBack>
    void connectTo(TitlerToolFactory* factory, CallBack* callBack);

    // Call when the service has given the client id: registers the notices. greet is called before any
    // request that has waited for the hand-shakes. The notices are not owned and must outlive this object.
    template <typename Notify, typename Greeting>
    void clientIdCame(int id, Notify* notify, Greeting greet);
    template <typename Notify>
    void clientIdCame(int id, Notify* notify)
    {
        clientIdCame(id, notify, [] {});
    }

    // Returns whether there is a service to call.
    explicit operator bool() const { return m_proxy != nullptr; }
    Service* operator->() const { return m_proxy; }
    // Returns whether the client id was received.
    bool isConnected() const { return m_isConnected; }
    // Returns the client id, NO_CLIENT_ID before it was received.
    int clientId() const { return m_clientId; }

    static constexpr int NO_CLIENT_ID = -1;

private:
    Service* m_proxy = nullptr; // owned by the factory
    int m_clientId = NO_CLIENT_ID;
    bool m_isConnected = false;
};

template <typename Service>
template <typename CallBack>
void ServiceLink<Service>::connectTo(TitlerToolFactory* factory, CallBack* callBack)
{
    if (m_isConnected)
        return;
    m_proxy = factory->createService<Service>();
    if (!m_proxy)
        return;
    EarlyRequests::getInstance()->expectClientId(Service::INTERFACE_ID);
    m_proxy->registerCallBack(callBack);
}

template <typename Service>
template <typename Notify, typename Greeting>
void ServiceLink<Service>::clientIdCame(int id, Notify* notify, Greeting greet)
{
    m_clientId = id;
    if (m_proxy) {
        // The services have different names for the same operation.
        if constexpr (requires { m_proxy->unregisterNotify(id); })
            m_proxy->registerNotify({notify, id});
        else
            m_proxy->registerNotifyCallBack({notify, id});
    }
    m_isConnected = true;
    greet();
    EarlyRequests::getInstance()->clientIdCame(Service::INTERFACE_ID);
}

template <typename Service>
ServiceLink<Service>::~ServiceLink()
{
    if (!m_proxy || !m_isConnected)
        return;
    m_proxy->unregisterCallBack(m_clientId);
    if constexpr (requires { m_proxy->unregisterNotify(m_clientId); })
        m_proxy->unregisterNotify(m_clientId);
    else
        m_proxy->unregisterNotifyCallBack(m_clientId);
}

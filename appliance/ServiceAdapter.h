#pragma once

#include "appliance/ServiceDescription.h"
#include "messaging/ptc/Adapter.h"

#include <functional>
#include <memory>

namespace PTC
{
class IProxyBase;
}

// Receives the calls of one service and passes them to a handler, with the name of the method and the
// parameters as JSON.
class ServiceAdapter : public PTC::Adapter
{
public:
    // The receiver of the calls. proxy is the client's proxy for a registration; null for other calls and if
    // the client cannot be reached.
    using Handler = std::function<void(const ServiceDescription& service, const ServiceMethod& method,
                                       const QJsonObject& args, std::unique_ptr<PTC::IProxyBase> proxy)>;

    ServiceAdapter(ServiceDescription service, Handler handler);

    void receive(PTC::Event* event) override;
    // Does nothing: the handler is the target.
    void setTarget(void* target) override;

private:
    std::unique_ptr<PTC::IProxyBase> proxyFor(const ServiceMethod& method, const QJsonObject& args);

    ServiceDescription m_service;
    Handler m_handler;
};

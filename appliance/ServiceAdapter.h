// Takes the calls of one service off the wire and hands them on by name, with their parameters as JSON.
#pragma once

#include "appliance/ServiceDescription.h"
#include "messaging/ptc/Adapter.h"

#include <functional>
#include <memory>

namespace PTC
{
class IProxyBase;
}

class ServiceAdapter : public PTC::Adapter
{
public:
    // Who takes the calls. proxy is what a registration made, null for other calls and for a client out of
    // reach.
    using Handler = std::function<void(const ServiceDescription& service, const ServiceMethod& method,
                                       const QJsonObject& args, std::unique_ptr<PTC::IProxyBase> proxy)>;

    ServiceAdapter(ServiceDescription service, Handler handler);

    void receive(PTC::Event* event) override;
    // The handler is the target; a pointer has no use here.
    void setTarget(void* target) override;

private:
    std::unique_ptr<PTC::IProxyBase> proxyFor(const ServiceMethod& method, const QJsonObject& args);

    ServiceDescription m_service;
    Handler m_handler;
};

#include "appliance/ServiceAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/IProxyBase.h"

#include <algorithm>

ServiceAdapter::ServiceAdapter(ServiceDescription service, Handler handler)
    : PTC::Adapter(service.interfaceId), m_service(std::move(service)), m_handler(std::move(handler))
{
}

void ServiceAdapter::setTarget(void*)
{
}

void ServiceAdapter::receive(PTC::Event* event)
{
    const auto method = std::ranges::find(m_service.methods, event->getMethodId(), &ServiceMethod::id);
    if (method == m_service.methods.end())
        return;
    const QJsonObject args = method->decode(method->parameter, event->getData(), event->getSize());
    m_handler(m_service, *method, args, proxyFor(*method, args));
}

std::unique_ptr<PTC::IProxyBase> ServiceAdapter::proxyFor(const ServiceMethod& method,
                                                          const QJsonObject& args)
{
    if (method.kind == ServiceMethod::Kind::Call)
        return nullptr;
    const bool callBack = method.kind == ServiceMethod::Kind::RegisterCallBack;
    const long type = callBack ? m_service.callBackAdapterType : m_service.notifyAdapterType;
    return std::unique_ptr<PTC::IProxyBase>(
        createProxy(type, args["adapterId"].toInt(), args["receiverIdentity"].toInt()));
}

#include "messaging/services/ServiceCall.h"

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/ptc/Proxy.h"

namespace ServiceCall
{

namespace
{

template <typename AnyProxy>
void invokePacked(AnyProxy& proxy, long methodId, simplebuffer& parameters)
{
    proxy.invokeMethod(methodId, parameters.data, static_cast<long>(parameters.size));
    CSimpleBuffer::simplebuffer_destroy(&parameters);
}

template <typename AnyProxy>
void invokeEmpty(AnyProxy& proxy, long methodId)
{
    unsigned char nothing[4] = {};
    proxy.invokeMethod(methodId, nothing, sizeof nothing);
}

} // namespace

void invoke(PTC::Proxy& proxy, long methodId, simplebuffer parameters)
{
    invokePacked(proxy, methodId, parameters);
}

void invoke(PTC::CallbackProxy& proxy, long methodId, simplebuffer parameters)
{
    invokePacked(proxy, methodId, parameters);
}

void invoke(PTC::Proxy& proxy, long methodId)
{
    invokeEmpty(proxy, methodId);
}

void invoke(PTC::CallbackProxy& proxy, long methodId)
{
    invokeEmpty(proxy, methodId);
}

void registerCallBack(PTC::Proxy& proxy, long methodId, long adapterType, void* target)
{
    _tagCallBackInfo info;
    info.adapterId = proxy.createAdapter(adapterType, target);
    info.receiverIdentity = proxy.getRRIdentity();
    invoke(proxy, methodId, RecordPacking::serialize(info));
}

void registerNotify(PTC::Proxy& proxy, long methodId, long adapterType, void* target, int clientId)
{
    _tagNotifyInfo info;
    info.adapterId = proxy.createAdapter(adapterType, target);
    info.receiverIdentity = proxy.getRRIdentity();
    info.clientId = clientId;
    invoke(proxy, methodId, RecordPacking::serialize(info));
}

} // namespace ServiceCall

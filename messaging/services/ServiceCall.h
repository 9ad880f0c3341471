#pragma once

#include "messaging/ptc/Event.h"
#include "messaging/services/RecordPacking.h"
#include "messaging/services/ServiceInterface.h"

#include <type_traits>

namespace PTC
{
class CallbackProxy;
class Proxy;
} // namespace PTC

// Sends and delivers calls: what the proxies do with a parameter, and what the adapters do with a message.
namespace ServiceCall
{

// The meaning of a row of a service's table, derived from the type of its parameter.
enum class Kind { Call, RegisterCallBack, RegisterNotify };

// Defines the type that is packed for a parameter. A registration is sent as a record of ids.
template <typename Parameter>
struct Packed {
    using Type = Parameter;
    static constexpr Kind KIND = Kind::Call;
};
template <typename CallBack>
struct Packed<CallBack*> {
    using Type = _tagCallBackInfo;
    static constexpr Kind KIND = Kind::RegisterCallBack;
};
template <typename Notify>
struct Packed<NotifyTarget<Notify>> {
    using Type = _tagNotifyInfo;
    static constexpr Kind KIND = Kind::RegisterNotify;
};

// Sends a call with packed parameters and destroys the buffer.
void invoke(PTC::Proxy& proxy, long methodId, simplebuffer parameters);
void invoke(PTC::CallbackProxy& proxy, long methodId, simplebuffer parameters);
// Sends a call without parameters. Its payload is 4 zero bytes, because a frame without a payload is not
// dispatched.
void invoke(PTC::Proxy& proxy, long methodId);
void invoke(PTC::CallbackProxy& proxy, long methodId);

// Both create an adapter for target, which points to the interface of that adapter type, and send its id to
// the service.
void registerCallBack(PTC::Proxy& proxy, long methodId, long adapterType, void* target);
void registerNotify(PTC::Proxy& proxy, long methodId, long adapterType, void* target, int clientId);

// Sends the call of a row: without a parameter, with a packed parameter, or as a registration.
template <typename AnyProxy>
void send(AnyProxy& proxy, long methodId)
{
    invoke(proxy, methodId);
}
template <typename AnyProxy, typename Parameter>
void send(AnyProxy& proxy, long methodId, const Parameter& parameter)
{
    if constexpr (Packed<Parameter>::KIND == Kind::RegisterCallBack) {
        registerCallBack(proxy, methodId, std::remove_pointer_t<Parameter>::ADAPTER_TYPE, parameter);
    } else if constexpr (Packed<Parameter>::KIND == Kind::RegisterNotify) {
        using Notify = std::remove_pointer_t<decltype(parameter.target)>;
        registerNotify(proxy, methodId, Notify::ADAPTER_TYPE, parameter.target, parameter.clientId);
    } else {
        invoke(proxy, methodId, RecordPacking::serialize(parameter));
    }
}

// Reads the parameter of a row from a message and calls the target with it. Does nothing for registrations,
// which the adapter of the service handles.
template <typename Interface>
void deliver(const PTC::Event&, Interface& target, void (Interface::*method)())
{
    (target.*method)();
}
template <typename Interface, typename Parameter>
void deliver(const PTC::Event& event, Interface& target, void (Interface::*method)(Parameter))
{
    if constexpr (Packed<Parameter>::KIND == Kind::Call) {
        Parameter parameter{};
        RecordPacking::deserialize(parameter, event.getData(), event.getSize());
        (target.*method)(parameter);
    }
}

} // namespace ServiceCall

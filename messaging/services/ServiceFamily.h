// Defines the proxies and adapters of a service from its table.
//
//     SERVICE_FAMILY(Example)             for a service with answers
//     SERVICE_FAMILY_WITH_EVENTS(Example) for one that also has events
// define for the client ExampleRemoteProxy, which sends the calls, and ExampleCallBackAdapter and
// ExampleNotifyAdapter, which receive answers and events; for the service ExampleCallBackRemoteProxy and
// ExampleNotifyRemoteProxy, which send them; and ExampleParams with a serialize_method_param and a
// deserialize_method_param for each row, for code that reads or writes single messages.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"
#include "messaging/ptc/CallbackProxy.h"
#include "messaging/ptc/Proxy.h"
#include "messaging/services/ServiceCall.h"
#include "messaging/services/TargetAdapter.h"

// clang-format off
#define SERVICE_FAMILY(Service) \
    SERVICE_CALL_FAMILY(Service); \
    using Service##Params = Service##AnswerParams

#define SERVICE_FAMILY_WITH_EVENTS(Service) \
    SERVICE_CALL_FAMILY(Service); \
    SERVICE_CLIENT_FAMILY(Service, Notify, Service##_EVENTS); \
    struct Service##Params : Service##AnswerParams { Service##_EVENTS(SERVICE_ROW_PARAMS) }

#define SERVICE_CALL_FAMILY(Service) \
    class Service##RemoteProxy : public I##Service, public PTC::Proxy \
    { \
    public: \
        using Interface = I##Service; \
        explicit Service##RemoteProxy(long id) : PTC::Proxy(static_cast<int>(id), true) {} \
        bool isReachable() const override { return isConnected(); } \
        Service##_CALLS(SERVICE_ROW_SEND) \
    }; \
    SERVICE_CLIENT_FAMILY(Service, CallBack, Service##_ANSWERS); \
    struct Service##CallParams { Service##_CALLS(SERVICE_ROW_PARAMS) }; \
    struct Service##AnswerParams : Service##CallParams { Service##_ANSWERS(SERVICE_ROW_PARAMS) }

#define SERVICE_CLIENT_FAMILY(Service, CallBack, ROWS) \
    class Service##CallBack##RemoteProxy; \
    class Service##CallBack##Adapter : public TargetAdapter<I##Service##CallBack, PTC::CallbackAdapter> \
    { \
    public: \
        using enum I##Service##CallBack::Method; \
        using Interface = I##Service##CallBack; \
        using Peer = Service##CallBack##RemoteProxy; \
        using TargetAdapter::TargetAdapter; \
    }; \
    class Service##CallBack##RemoteProxy : public I##Service##CallBack, public PTC::CallbackProxy \
    { \
    public: \
        /* id is the client's adapter id. */ \
        explicit Service##CallBack##RemoteProxy(long id) : PTC::CallbackProxy(static_cast<int>(id), true) {} \
        ROWS(SERVICE_ROW_SEND) \
    }

#define SERVICE_ROW_SEND(id, name, ...) \
    void name(__VA_OPT__(SERVICE_PARAMETER(__VA_ARGS__))) override \
    { \
        ServiceCall::send(*this, METHOD_##name __VA_OPT__(, SERVICE_PARAMETER_NAME(__VA_ARGS__))); \
    }
#define SERVICE_ROW_PARAMS(id, name, ...) __VA_OPT__(SERVICE_PARAMS(name, SERVICE_PARAMETER_TYPE(__VA_ARGS__)))
#define SERVICE_PARAMS(name, Parameter) \
    static simplebuffer serialize_##name##_param(const ServiceCall::Packed<Parameter>::Type& param) \
    { \
        return RecordPacking::serialize(param); \
    } \
    static void deserialize_##name##_param(ServiceCall::Packed<Parameter>::Type& param, void* data, long size) \
    { \
        RecordPacking::deserialize(param, data, size); \
    }
// clang-format on

// Declares the interfaces of a service from its table. A table is a header with three lists of rows, each
//     ROW(id, name)  or  ROW(id, name, type of the parameter, name of the parameter)
// where id is the id of the method on the wire. Example_CALLS lists the calls of clients, Example_ANSWERS the
// answers to a client, Example_EVENTS what the service reports to clients. Below the lists
//     SERVICE(Example, interface id, client number of its process, number of its operations,
//             type of the callback adapter, type of the notify adapter);
//     SERVICE_ANSWERS(Example);
//     SERVICE_EVENTS(Example);
// declare IExample, IExampleCallBack and IExampleNotify. messaging/services/ServiceFamilies.h declares the
// proxies and adapters of both sides from the same lists.
//
// Calls are one-way and run in the caller's thread; answers and events arrive as calls in the GUI thread. A
// parameter that is a pointer to a callback interface, or a NotifyTarget, is a registration; the caller keeps
// ownership of the target. The rows of an interface are also available at run time: forEachMethod(visit)
// calls visit(id, name, pointer to the member function, name of the parameter or "").
#pragma once

#include "messaging/services/ServiceTable.h"

// The object that receives the events, and the client id that the service has assigned.
template <typename Notify>
struct NotifyTarget {
    Notify* target = nullptr;
    int clientId = -1;
};

#ifndef Q_MOC_RUN // moc does not support __VA_OPT__ and needs none of these classes
// clang-format off
#define SERVICE(Service, id, client, operations, callBackAdapter, notifyAdapter) \
    class I##Service \
    { \
    public: \
        static constexpr const char* NAME = #Service; \
        static constexpr long INTERFACE_ID = id; \
        static constexpr long CLIENT = ServiceTable::client; \
        static constexpr int OPERATIONS = operations; \
        static constexpr long CALLBACK_ADAPTER_TYPE = callBackAdapter; \
        static constexpr long NOTIFY_ADAPTER_TYPE = notifyAdapter; \
        /* Returns false if the service's process is known not to be running, so calls would be lost. */ \
        virtual bool isReachable() const { return true; } \
        SERVICE_INTERFACE_METHODS(I##Service, Service##_CALLS) \
    }

#define SERVICE_ANSWERS(Service) \
    class I##Service##CallBack \
    { \
    public: \
        using Calls = I##Service; \
        static constexpr long ADAPTER_TYPE = I##Service::CALLBACK_ADAPTER_TYPE; \
        SERVICE_INTERFACE_METHODS(I##Service##CallBack, Service##_ANSWERS) \
    }

#define SERVICE_EVENTS(Service) \
    class I##Service##Notify \
    { \
    public: \
        using Calls = I##Service; \
        static constexpr long ADAPTER_TYPE = I##Service::NOTIFY_ADAPTER_TYPE; \
        SERVICE_INTERFACE_METHODS(I##Service##Notify, Service##_EVENTS) \
    }

#define SERVICE_INTERFACE_METHODS(Interface, ROWS) \
    virtual ~Interface() = default; \
    enum Method : long { ROWS(SERVICE_ROW_ID) }; \
    ROWS(SERVICE_ROW_METHOD) \
    template <typename Visitor> \
    static void forEachMethod(const Visitor& visit) \
    { \
        using Self = Interface; \
        ROWS(SERVICE_ROW_VISIT) \
    }

#define SERVICE_ROW_ID(id, name, ...) METHOD_##name = id,
#define SERVICE_ROW_METHOD(id, name, ...) \
    virtual void name(__VA_OPT__(SERVICE_PARAMETER(__VA_ARGS__))) = 0;
#define SERVICE_ROW_VISIT(id, name, ...) \
    visit(METHOD_##name, #name, &Self::name, "" __VA_OPT__(SERVICE_PARAMETER_TEXT(__VA_ARGS__)));

#define SERVICE_PARAMETER(Type, parameter) Type parameter
#define SERVICE_PARAMETER_TYPE(Type, parameter) Type
#define SERVICE_PARAMETER_NAME(Type, parameter) parameter
#define SERVICE_PARAMETER_TEXT(Type, parameter) #parameter
// clang-format on
#endif

#include "appliance/Appliance.h"

#include "appliance/JsonRecords.h"
#include "messaging/services/IAPPEventFilterCallBack.h"
#include "messaging/services/IAPPEventFilterNotify.h"
#include "messaging/services/IFileManagerControllerCallBack.h"
#include "messaging/services/IMessageCenterCallBack.h"
#include "messaging/services/IMessageCenterNotify.h"
#include "messaging/services/IPowerManagerCallBack.h"
#include "messaging/services/IProjectDataManagerCallBack.h"
#include "messaging/services/ISoftKeyBoardControllerCallBack.h"
#include "messaging/services/ISystemSetupManagerCallBack.h"
#include "messaging/services/ServiceTable.h"
#include "messaging/services/TitlerAdapter.h"

#include <algorithm>

Appliance::Appliance(EventSink sink) : m_sink(std::move(sink))
{
}

Appliance::~Appliance()
{
    m_titler.reset();
    m_clients.clear();
}

bool Appliance::start()
{
    m_main = std::make_unique<Sibling>(ServiceTable::MAIN_CLIENT, ServiceTable::MAIN_CLIENT_KEY);
    m_subPanel =
        std::make_unique<Sibling>(ServiceTable::SUB_PANEL_CLIENT, ServiceTable::SUB_PANEL_CLIENT_KEY);
    const auto handler = [this](const ServiceDescription& service, const ServiceMethod& method,
                                const QJsonObject& args, std::unique_ptr<PTC::IProxyBase> proxy) {
        handleCall(service, method, args, std::move(proxy));
    };
    for (const ServiceDescription& service : describeServices()) {
        const ServiceTable::Service* entry = ServiceTable::findByInterface(service.interfaceId);
        Sibling& home = entry->clientKey == ServiceTable::MAIN_CLIENT_KEY ? *m_main : *m_subPanel;
        home.addService(service, handler);
    }
    return m_main->initialize() && m_subPanel->initialize();
}

bool Appliance::connectToTitler()
{
    return m_main->connectTo(ServiceTable::TITLER_CLIENT) &&
           m_subPanel->connectTo(ServiceTable::TITLER_CLIENT);
}

ITitler* Appliance::titler()
{
    if (!m_main->connectTo(ServiceTable::TITLER_CLIENT)) {
        return nullptr;
    }
    if (m_titler == nullptr) {
        void* instance = nullptr;
        m_main->createInstance(TitlerAdapter::INTERFACE_ID, &instance);
        m_titler.reset(static_cast<ITitler*>(instance));
    }
    return m_titler.get();
}

bool Appliance::registerAtTitler()
{
    ITitler* service = titler();
    if (service == nullptr) {
        return false;
    }
    service->registerCallBack(this);
    return true;
}

int Appliance::clientIdOf(const QString& service)
{
    return m_clients[service].clientId;
}

std::optional<QJsonObject> Appliance::takeCall(const QString& service, const QString& method)
{
    for (KeptCall& call : m_calls) {
        if (!call.taken && call.event["service"] == service && call.event["method"] == method) {
            call.taken = true;
            return call.event;
        }
    }
    return std::nullopt;
}

int Appliance::countCalls(const QString& service, const QString& method) const
{
    return static_cast<int>(std::ranges::count_if(m_calls, [&](const KeptCall& call) {
        return call.event["service"] == service && call.event["method"] == method;
    }));
}

std::optional<QJsonObject> Appliance::takeResult()
{
    if (m_results.empty()) {
        return std::nullopt;
    }
    QJsonObject result = m_results.front();
    m_results.pop_front();
    return result;
}

void Appliance::forgetCallsAndResults()
{
    m_calls.clear();
    m_results.clear();
}

void Appliance::finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param)
{
    QJsonObject result = JsonRecords::toJson(param);
    m_results.push_back(result);
    result.insert("event", "callback");
    result.insert("method", "finishTitlerCreateCallback");
    m_sink(result);
}

void Appliance::handleCall(const ServiceDescription& service, const ServiceMethod& method,
                           const QJsonObject& args, std::unique_ptr<PTC::IProxyBase> proxy)
{
    const QString serviceName = service.name;
    const QString methodName = method.name;
    const QJsonObject event{
        {"event", "call"}, {"service", serviceName}, {"method", methodName}, {"args", args}};
    keep(event);
    m_sink(event);
    Client& client = m_clients[serviceName];
    switch (method.kind) {
    case ServiceMethod::Kind::RegisterCallBack:
        client.callBack = std::move(proxy);
        giveClientId(serviceName);
        break;
    case ServiceMethod::Kind::RegisterNotify:
        client.notify = std::move(proxy);
        break;
    case ServiceMethod::Kind::Call:
        if (methodName.startsWith("unregister")) {
            unregister(serviceName, methodName, args["clientId"].toInt());
        } else {
            answer(serviceName, methodName, args);
        }
        break;
    }
}

void Appliance::keep(const QJsonObject& event)
{
    m_calls.push_back({event});
    if (m_calls.size() > KEPT_CALLS) {
        m_calls.pop_front();
    }
}

// A client that registers again, because it was started anew, gets a new id.
void Appliance::giveClientId(const QString& service)
{
    const int id = m_lastClientId + 1;
    if (auto* eventFilter = callBackOf<IAPPEventFilterCallBack>(service)) {
        eventFilter->setClientID(id);
    } else if (auto* fileManager = callBackOf<IFileManagerControllerCallBack>(service)) {
        fileManager->getClientID(id);
    } else if (auto* messageCenter = callBackOf<IMessageCenterCallBack>(service)) {
        messageCenter->setClientID(id);
    } else if (auto* power = callBackOf<IPowerManagerCallBack>(service)) {
        power->getClientID(id);
    } else if (auto* project = callBackOf<IProjectDataManagerCallBack>(service)) {
        project->getClientID(id);
    } else if (auto* setup = callBackOf<ISystemSetupManagerCallBack>(service)) {
        setup->getClientID(id);
    } else {
        return; // the services of the sub panel give none
    }
    m_lastClientId = id;
    m_clients[service].clientId = id;
}

void Appliance::unregister(const QString& service, const QString& method, int clientId)
{
    Client& client = m_clients[service];
    if (clientId != client.clientId) {
        return;
    }
    if (method == "unregisterCallBack") {
        client.callBack.reset();
    } else {
        client.notify.reset();
    }
}

void Appliance::answer(const QString& service, const QString& method, const QJsonObject& args)
{
    if (service == "MessageCenter") {
        answerMessageCenter(method, args);
    } else if (service == "APPEventFilter") {
        answerEventFilter(method, args);
    } else if (service == "SoftKeyBoardController") {
        answerKeyboard(method, args);
    } else if (service == "SystemSetupManager") {
        answerSystemSetup(method);
    }
}

void Appliance::answerMessageCenter(const QString& method, const QJsonObject& args)
{
    auto* callBack = callBackOf<IMessageCenterCallBack>("MessageCenter");
    auto* notify = notifyOf<IMessageCenterNotify>("MessageCenter");
    if (method == "setTopWindow") {
        state.topWindow = args["topWindow"].toInt();
        if (notify != nullptr) {
            notify->getTopWindowNotify(state.topWindow);
        }
    } else if (method == "getTopWindow" && callBack != nullptr) {
        callBack->getTopWindowCallBack(state.topWindow);
    } else if (method == "postMessage" && notify != nullptr) {
        notify->postMessageNotify(JsonRecords::message(args));
    } else if (method == "showBar" && notify != nullptr) {
        notify->showBarNotify(args["bar"].toInt());
    }
}

void Appliance::answerEventFilter(const QString& method, const QJsonObject& args)
{
    auto* notify = notifyOf<IAPPEventFilterNotify>("APPEventFilter");
    if (notify == nullptr || !options.eventEcho) {
        return;
    }
    if (method == "postAPPEventFilter") {
        notify->postAPPEventFilterNotify(JsonRecords::appEvent(args));
    } else if (method == "postRestoreOriginal") {
        notify->postRestoreOriginalNotify(JsonRecords::appEvent(args));
    } else if (method == "postRestoreFocus") {
        notify->postRestoreFocusNotify();
    }
}

void Appliance::answerKeyboard(const QString& method, const QJsonObject& args)
{
    auto* callBack = callBackOf<ISoftKeyBoardControllerCallBack>("SoftKeyBoardController");
    if (callBack == nullptr) {
        return;
    }
    if (method == "sendKey" && options.keyEcho) {
        callBack->sendKey(JsonRecords::key(args));
    } else if ((method == "close" || method == "dummyClose" || method == "simpleClose") &&
               options.stateOnClose) {
        callBack->sendSoftKeyboardState(false);
    }
}

void Appliance::answerSystemSetup(const QString& method)
{
    auto* callBack = callBackOf<ISystemSetupManagerCallBack>("SystemSetupManager");
    if (callBack == nullptr) {
        return;
    }
    if (method == "getLanguageInfo") {
        callBack->getLanguageInfoCallBack(
            {clientIdOf("SystemSetupManager"), state.systemLanguage, state.inputLanguage});
    } else if (method == "getInformation") {
        callBack->getInformationCallBack({state.module});
    }
}

#include "appliance/Appliance.h"

#include "appliance/JsonRecords.h"
#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IFileManagerController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IPowerManager.h"
#include "messaging/services/IProjectDataManager.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"
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
    if (!m_main->connectTo(ServiceTable::TITLER_CLIENT))
        return nullptr;
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
    if (service == nullptr)
        return false;
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
    if (m_results.empty())
        return std::nullopt;
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
        if (methodName.startsWith("unregister"))
            unregister(serviceName, methodName, args["clientId"].toInt());
        else
            answer(service.interfaceId, method.id, args);
        break;
    }
}

void Appliance::keep(const QJsonObject& event)
{
    m_calls.push_back({event});
    if (m_calls.size() > KEPT_CALLS)
        m_calls.pop_front();
}

template <typename CallBack>
bool Appliance::giveClientId(void (CallBack::*give)(int), const QString& service, int id)
{
    if (service != CallBack::Calls::NAME || callBackOf<CallBack>() == nullptr)
        return false;
    (callBackOf<CallBack>()->*give)(id);
    return true;
}

// A client that registers again after a restart gets a new id. The services of the sub panel assign no ids.
void Appliance::giveClientId(const QString& service)
{
    const int id = m_lastClientId + 1;
    if (giveClientId(&IAPPEventFilterCallBack::setClientID, service, id) ||
        giveClientId(&IFileManagerControllerCallBack::getClientID, service, id) ||
        giveClientId(&IMessageCenterCallBack::setClientID, service, id) ||
        giveClientId(&IPowerManagerCallBack::getClientID, service, id) ||
        giveClientId(&IProjectDataManagerCallBack::getClientID, service, id) ||
        giveClientId(&ISystemSetupManagerCallBack::getClientID, service, id)) {
        m_lastClientId = id;
        m_clients[service].clientId = id;
    }
}

void Appliance::unregister(const QString& service, const QString& method, int clientId)
{
    Client& client = m_clients[service];
    if (clientId != client.clientId)
        return;
    if (method == "unregisterCallBack")
        client.callBack.reset();
    else
        client.notify.reset();
}

void Appliance::answer(long interfaceId, long method, const QJsonObject& args)
{
    switch (interfaceId) {
    case IMessageCenter::INTERFACE_ID:
        return answerMessageCenter(method, args);
    case IAPPEventFilter::INTERFACE_ID:
        return answerEventFilter(method, args);
    case ISoftKeyBoardController::INTERFACE_ID:
        return answerKeyboard(method, args);
    case ISystemSetupManager::INTERFACE_ID:
        return answerSystemSetup(method);
    default:
        break;
    }
}

void Appliance::answerMessageCenter(long method, const QJsonObject& args)
{
    auto* callBack = callBackOf<IMessageCenterCallBack>();
    auto* notify = notifyOf<IMessageCenterNotify>();
    if (method == IMessageCenter::METHOD_setTopWindow) {
        state.topWindow = args["topWindow"].toInt();
        if (notify != nullptr)
            notify->getTopWindowNotify(state.topWindow);
    } else if (method == IMessageCenter::METHOD_getTopWindow && callBack != nullptr) {
        callBack->getTopWindowCallBack(state.topWindow);
    } else if (method == IMessageCenter::METHOD_postMessage && notify != nullptr) {
        notify->postMessageNotify(JsonRecords::fromJson<MessageDefine::_tagMessageParam>(args));
    } else if (method == IMessageCenter::METHOD_showBar && notify != nullptr) {
        notify->showBarNotify(args["bar"].toInt());
    }
}

void Appliance::answerEventFilter(long method, const QJsonObject& args)
{
    auto* notify = notifyOf<IAPPEventFilterNotify>();
    if (notify == nullptr || !options.eventEcho)
        return;
    if (method == IAPPEventFilter::METHOD_postAPPEventFilter)
        notify->postAPPEventFilterNotify(JsonRecords::fromJson<APPEventDefine::_tagAPPEvent>(args));
    else if (method == IAPPEventFilter::METHOD_postRestoreOriginal)
        notify->postRestoreOriginalNotify(JsonRecords::fromJson<APPEventDefine::_tagAPPEvent>(args));
    else if (method == IAPPEventFilter::METHOD_postRestoreFocus)
        notify->postRestoreFocusNotify();
}

void Appliance::answerKeyboard(long method, const QJsonObject& args)
{
    using Keyboard = ISoftKeyBoardController;
    auto* callBack = callBackOf<ISoftKeyBoardControllerCallBack>();
    if (callBack == nullptr)
        return;
    if (method == Keyboard::METHOD_sendKey && options.keyEcho)
        callBack->sendKey(JsonRecords::fromJson<SubCommonDefine::tagSoftKeyBoardKeyData>(args));
    else if ((method == Keyboard::METHOD_close || method == Keyboard::METHOD_dummyClose ||
              method == Keyboard::METHOD_simpleClose) &&
             options.stateOnClose)
        callBack->sendSoftKeyboardState(false);
}

void Appliance::answerSystemSetup(long method)
{
    auto* callBack = callBackOf<ISystemSetupManagerCallBack>();
    if (callBack == nullptr)
        return;
    if (method == ISystemSetupManager::METHOD_getLanguageInfo) {
        callBack->getLanguageInfoCallBack(
            {clientIdOf(ISystemSetupManager::NAME), state.systemLanguage, state.inputLanguage});
    } else if (method == ISystemSetupManager::METHOD_getInformation) {
        callBack->getInformationCallBack({state.module});
    }
}

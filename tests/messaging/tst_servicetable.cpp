// Every method of the eight services, from the proxy to the adapter at the other end, and the table of all
// services.
#include "appliance/ServiceAdapter.h"
#include "messaging/ptc/CallbackProxy.h"
#include "messaging/ptc/IAdapterFactory.h"
#include "messaging/ptc/IProxyFactory.h"
#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IFileManagerController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IPowerManager.h"
#include "messaging/services/IProjectDataManager.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"
#include "messaging/services/TitlerAdapter.h"
#include "messaging/services/TitlerParams.h"
#include "tests/fakes/FakeTitler.h"
#include "tests/fakes/FakeTitlerCallBack.h"
#include "tests/fakes/LoopSender.h"
#include "tests/support/RandomSeed.h"

#include <QJsonDocument>
#include <QTest>

#include <random>
#include <set>

namespace
{

const std::wstring TEXT = L"快讯 속보 é";
const QString QTEXT = QString::fromStdWString(TEXT);

QString say(const std::wstring& text)
{
    return QString::fromStdWString(text);
}

// The client of all services, which records the calls.
class Client : public IAPPEventFilterCallBack,
               public IAPPEventFilterNotify,
               public IFileManagerControllerCallBack,
               public IFileManagerControllerNotify,
               public IMessageCenterCallBack,
               public IMessageCenterNotify,
               public IPowerManagerCallBack,
               public IPowerManagerNotify,
               public IProjectDataManagerCallBack,
               public IProjectDataManagerNotify,
               public IShowTitlerControllerCallBack,
               public ISoftKeyBoardControllerCallBack,
               public ISystemSetupManagerCallBack,
               public ISystemSetupManagerNotify
{
public:
    void setClientID(int id) override { add("setClientID", {id}); }
    void getClientID(int id) override { add("getClientID", {id}); }
    void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent e) override
    {
        add("postAPPEventFilterNotify", {e.clientId, e.lockType, e.flag, e.eventReceiver});
    }
    void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent e) override
    {
        add("postRestoreOriginalNotify", {e.clientId, e.lockType, e.flag, e.eventReceiver});
    }
    void postRestoreFocusNotify() override { add("postRestoreFocusNotify", {}); }
    void importNotify(FileManagerDefine::tagImportNotify p) override
    {
        add("importNotify", {p.fileType, p.fileTypeHigh, p.third, static_cast<qint64>(p.fourth), p.fifth,
                             say(p.path), p.seventh, p.eighth, say(p.strings[0]), say(p.strings[1]),
                             say(p.strings[2]), p.twelfth, p.thirteenth, p.last[0], p.last[6]});
    }
    void deleteNotify(FileManagerDefine::tagDeleteNotify p) override
    {
        add("deleteNotify",
            {p.first, p.fileType, p.result, say(p.path), p.fifth, static_cast<qint64>(p.sixth), p.seventh});
    }
    void renameTitlerTemplateNotify(FileManagerDefine::tagRenameNotify p) override
    {
        add("renameTitlerTemplateNotify", {p.fileType, p.second, p.third, say(p.strings[0]),
                                           say(p.strings[1]), say(p.strings[2]), say(p.strings[3])});
    }
    void updateTitlerFolderInFileManagerDelete(std::wstring name) override
    {
        add("updateTitlerFolderInFileManagerDelete", {say(name)});
    }
    void updateFolderNameInCurrentProjectNotify(FileManagerDefine::tagChangeFolderNameParam p) override
    {
        add("updateFolderNameInCurrentProjectNotify", {p.clientId, say(p.oldPath), say(p.newPath)});
    }
    void getTopWindowCallBack(int top) override { add("getTopWindowCallBack", {top}); }
    void getTopWindowNotify(int top) override { add("getTopWindowNotify", {top}); }
    void postMessageNotify(MessageDefine::_tagMessageParam p) override
    {
        add("postMessageNotify", {p.clientId, p.boxKind, p.boxType, say(p.first), say(p.text), p.messageId});
    }
    void closeMessageNotify(MessageDefine::_tagCloseParam p) override
    {
        add("closeMessageNotify", {p.clientId, p.closeType, p.messageId});
    }
    void showBarNotify(int bar) override { add("showBarNotify", {bar}); }
    void powerOff() override { add("powerOff", {}); }
    void powerOn() override { add("powerOn", {}); }
    void loadNotify(int state) override { add("loadNotify", {state}); }
    void showTitler() override { add("showTitler", {}); }
    void sendInputString(std::wstring t) override { add("sendInputString", {say(t)}); }
    void sendInputStringOnEnterPressing(std::wstring t) override
    {
        add("sendInputStringOnEnterPressing", {say(t)});
    }
    void sendInputStringOnTextChanged(std::wstring t) override
    {
        add("sendInputStringOnTextChanged", {say(t)});
    }
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData k) override
    {
        add("sendKey", {k.eventType, k.key, k.modifiers, say(k.text), k.autoRepeat, k.nativeVirtualKey});
    }
    void sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos p) override
    {
        add("sendInputStringSelectionPos", {p.begin, p.end, p.current, p.mode});
    }
    void sendSoftKeyboardState(bool shown) override { add("sendSoftKeyboardState", {shown}); }
    void getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam p) override
    {
        add("getLanguageInfoCallBack", {p.first, p.systemLanguage, p.inputLanguage});
    }
    void getInformationCallBack(SystemSetupDef::tagSystemInformation p) override
    {
        add("getInformationCallBack", {p.model});
    }
    void setSystemLanguageNotify(int language) override { add("setSystemLanguageNotify", {language}); }
    void setInputLanguageNotify(int language) override { add("setInputLanguageNotify", {language}); }

    QString take()
    {
        const QString all = m_calls.join('|');
        m_calls.clear();
        return all;
    }

private:
    void add(const char* method, const QVariantList& values)
    {
        QStringList texts;
        for (const QVariant& value : values)
            texts.append(value.toString());
        m_calls.append(QString(method) + "(" + texts.join(",") + ")");
    }

    QStringList m_calls;
};

} // namespace

// Both ends in one process: the appliance's adapters in one receiver, the client's in another.
class tst_servicetable : public QObject, private PTC::IAdapterFactory, private PTC::IProxyFactory
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void appEventFilter();
    void fileManager();
    void messageCenter();
    void powerManager();
    void projectDataManager();
    void showTitlerController();
    void softKeyBoard();
    void systemSetupManager();
    void callsWithoutParametersCarryFourBytes();
    void unknownMethodsLeaveTheTargetAlone();
    void adaptersWithoutTarget();
    void randomPayloadsReachNothingBad();
    void titler();
    void titlerRegistrationWithinTheProcess();
    void titlerUnknownMethods();
    void tableOfServices();
    void familiesOfServices();
    void senderKeys();

private:
    static constexpr long MY_CLIENT = 1003;

    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override;
    long getRRIdentity() override { return MY_CLIENT; }
    PTC::IProxyBase* createProxy(long type, long id, long client) override;

    template <typename Interface>
    Interface* service(long interfaceId);
    template <typename Interface>
    Interface& peer();
    QString takeCall();

    std::unique_ptr<PTC::Receiver> m_server;
    std::unique_ptr<PTC::Receiver> m_clientReceiver;
    std::unique_ptr<LoopSender> m_toServer;
    std::unique_ptr<LoopSender> m_toClient;
    std::vector<std::unique_ptr<PTC::Proxy>> m_proxies;
    std::vector<std::unique_ptr<PTC::IProxyBase>> m_peers; // what the server has of the client
    QStringList m_calls;
    Client m_client;
    long m_lastAdapterId = -1;
};

PTC::IAdapterBase* tst_servicetable::createAdapter(long type, PTC::IReceiver* receiver, void* target)
{
    PTC::IAdapterBase* adapter = type == TitlerAdapter::CALLBACK_INTERFACE_ID
                                     ? new TitlerCallBackAdapter(++m_lastAdapterId)
                                     : ServiceFamilies::createAdapter(type, ++m_lastAdapterId);
    adapter->setTarget(target);
    receiver->addCBAdapter(adapter);
    return adapter;
}

PTC::IProxyBase* tst_servicetable::createProxy(long type, long id, long client)
{
    if (client != MY_CLIENT)
        return nullptr;
    PTC::CallbackProxy* proxy = type == TitlerAdapter::CALLBACK_INTERFACE_ID
                                    ? new TitlerCallBackRemoteProxy(id)
                                    : ServiceFamilies::createClientProxy(type, id);
    proxy->setSender(m_toClient.get());
    return proxy;
}

void tst_servicetable::init()
{
    m_server = std::make_unique<PTC::Receiver>(1);
    m_clientReceiver = std::make_unique<PTC::Receiver>(4);
    m_toServer = std::make_unique<LoopSender>(1, *m_server);
    m_toClient = std::make_unique<LoopSender>(4, *m_clientReceiver);
    for (const ServiceDescription& description : describeServices()) {
        auto* adapter = new ServiceAdapter(
            description, [this](const ServiceDescription& called, const ServiceMethod& method,
                                const QJsonObject& args, std::unique_ptr<PTC::IProxyBase> proxy) {
                m_calls.append(QString(called.name) + "." + method.name + " " +
                               QJsonDocument(args).toJson(QJsonDocument::Compact));
                if (proxy != nullptr)
                    m_peers.push_back(std::move(proxy));
            });
        adapter->setProxyFactory(this);
        m_server->addAdapter(adapter);
    }
}

void tst_servicetable::cleanup()
{
    QCOMPARE(m_calls, QStringList());
    QCOMPARE(m_client.take(), QString());
    m_peers.clear();
    m_proxies.clear();
}

template <typename Interface>
Interface* tst_servicetable::service(long interfaceId)
{
    void* instance = nullptr;
    PTC::Proxy* proxy = ServiceFamilies::createProxy(interfaceId, &instance);
    m_proxies.emplace_back(proxy);
    proxy->setSender(m_toServer.get());
    proxy->setReceiver(m_clientReceiver.get());
    proxy->setAdapterFactory(this);
    return static_cast<Interface*>(instance);
}

template <typename Interface>
Interface& tst_servicetable::peer()
{
    return dynamic_cast<Interface&>(*m_peers.back());
}

QString tst_servicetable::takeCall()
{
    return m_calls.isEmpty() ? QString() : m_calls.takeFirst();
}

void tst_servicetable::appEventFilter()
{
    auto* filter = service<IAPPEventFilter>(1);
    const QString event = R"({"clientId":5,"eventReceiver":3,"flag":true,"lockType":2})";
    filter->postAPPEventFilter({5, 2, true, 3});
    QCOMPARE(takeCall(), "APPEventFilter.postAPPEventFilter " + event);
    filter->postRestoreOriginal({5, 2, true, 3});
    QCOMPARE(takeCall(), "APPEventFilter.postRestoreOriginal " + event);
    filter->postRestoreFocus();
    QCOMPARE(takeCall(), "APPEventFilter.postRestoreFocus {}");
    filter->unregisterCallBack(5);
    QCOMPARE(takeCall(), R"(APPEventFilter.unregisterCallBack {"clientId":5})");
    filter->unregisterNotify(5);
    QCOMPARE(takeCall(), R"(APPEventFilter.unregisterNotify {"clientId":5})");
    filter->registerCallBack(&m_client);
    QCOMPARE(takeCall(), R"(APPEventFilter.registerCallBack {"adapterId":0,"receiverIdentity":1003})");
    peer<IAPPEventFilterCallBack>().setClientID(77);
    QCOMPARE(m_client.take(), "setClientID(77)");
    filter->registerNotify({&m_client, 77});
    QCOMPARE(takeCall(),
             R"(APPEventFilter.registerNotify {"adapterId":1,"clientId":77,"receiverIdentity":1003})");
    auto& notify = peer<IAPPEventFilterNotify>();
    notify.postAPPEventFilterNotify({1, 1, true, 4});
    QCOMPARE(m_client.take(), "postAPPEventFilterNotify(1,1,true,4)");
    notify.postRestoreOriginalNotify({1, 0, false, 4});
    QCOMPARE(m_client.take(), "postRestoreOriginalNotify(1,0,false,4)");
    notify.postRestoreFocusNotify();
    QCOMPARE(m_client.take(), "postRestoreFocusNotify()");
}

void tst_servicetable::fileManager()
{
    auto* files = service<IFileManagerController>(36);
    files->updateTitlerStatus({3, TEXT, 5});
    QCOMPARE(takeCall(),
             "FileManagerController.updateTitlerStatus {\"changeType\":5,\"clientId\":3,\"path\":\"" + QTEXT +
                 "\"}");
    const auto path = [](const char* method) {
        return QString("FileManagerController.") + method + " {\"clientId\":3,\"path\":\"" + QTEXT + "\"}";
    };
    files->renameFolderStart({3, TEXT});
    QCOMPARE(takeCall(), path("renameFolderStart"));
    files->titlerEditStatus({3, TEXT});
    QCOMPARE(takeCall(), path("titlerEditStatus"));
    files->titlerEditEndStatus({3, TEXT});
    QCOMPARE(takeCall(), path("titlerEditEndStatus"));
    files->updateTitlerOrder({3, TEXT});
    QCOMPARE(takeCall(), path("updateTitlerOrder"));
    files->updateTitlerFolderName({3, L"old", L"new"});
    QCOMPARE(
        takeCall(),
        R"(FileManagerController.updateTitlerFolderName {"clientId":3,"newPath":"new","oldPath":"old"})");
    files->unregisterCallBack(3);
    QCOMPARE(takeCall(), R"(FileManagerController.unregisterCallBack {"clientId":3})");
    files->unregisterNotify(3);
    QCOMPARE(takeCall(), R"(FileManagerController.unregisterNotify {"clientId":3})");
    files->registerCallBack(&m_client);
    QVERIFY(takeCall().startsWith("FileManagerController.registerCallBack"));
    peer<IFileManagerControllerCallBack>().getClientID(9);
    QCOMPARE(m_client.take(), "getClientID(9)");
    files->registerNotify({&m_client, 9});
    QVERIFY(takeCall().startsWith("FileManagerController.registerNotify"));
    auto& notify = peer<IFileManagerControllerNotify>();
    notify.importNotify(
        {8, 1, 2, -3000000000L, 4, TEXT, 5, 6, {L"a", L"b", L"c"}, 7, true, {1, 2, 3, 4, 5, 6, 70}});
    QCOMPARE(m_client.take(), "importNotify(8,1,2,-3000000000,4," + QTEXT + ",5,6,a,b,c,7,true,1,70)");
    notify.deleteNotify({1, 8, 0, TEXT, 2, 3000000000L, 4});
    QCOMPARE(m_client.take(), "deleteNotify(1,8,0," + QTEXT + ",2,3000000000,4)");
    notify.renameTitlerTemplateNotify({8, 1, 2, {L"w", L"x", L"y", TEXT}});
    QCOMPARE(m_client.take(), "renameTitlerTemplateNotify(8,1,2,w,x,y," + QTEXT + ")");
    notify.updateTitlerFolderInFileManagerDelete(TEXT);
    QCOMPARE(m_client.take(), "updateTitlerFolderInFileManagerDelete(" + QTEXT + ")");
    notify.updateFolderNameInCurrentProjectNotify({1, L"o", L"n"});
    QCOMPARE(m_client.take(), "updateFolderNameInCurrentProjectNotify(1,o,n)");
}

void tst_servicetable::messageCenter()
{
    auto* center = service<IMessageCenter>(65);
    center->setTopWindow({4, 1});
    QCOMPARE(takeCall(), R"(MessageCenter.setTopWindow {"clientId":4,"topWindow":1})");
    center->getTopWindow(4);
    QCOMPARE(takeCall(), R"(MessageCenter.getTopWindow {"clientId":4})");
    center->postMessage({4, 2, -1, L"", TEXT, 109});
    QCOMPARE(takeCall(),
             "MessageCenter.postMessage {\"boxKind\":2,\"boxType\":-1,\"clientId\":4,\"first\":\"\","
             "\"messageId\":109,\"text\":\"" +
                 QTEXT + "\"}");
    center->closeMessage({4, 2, 117});
    QCOMPARE(takeCall(), R"(MessageCenter.closeMessage {"clientId":4,"closeType":2,"messageId":117})");
    center->showBar(6);
    QCOMPARE(takeCall(), R"(MessageCenter.showBar {"bar":6})");
    center->unregisterCallBack(4);
    QCOMPARE(takeCall(), R"(MessageCenter.unregisterCallBack {"clientId":4})");
    center->unregisterNotify(4);
    QCOMPARE(takeCall(), R"(MessageCenter.unregisterNotify {"clientId":4})");
    center->registerCallBack(&m_client);
    QVERIFY(takeCall().startsWith("MessageCenter.registerCallBack"));
    peer<IMessageCenterCallBack>().setClientID(4);
    peer<IMessageCenterCallBack>().getTopWindowCallBack(2);
    QCOMPARE(m_client.take(), "setClientID(4)|getTopWindowCallBack(2)");
    center->registerNotify({&m_client, 4});
    QVERIFY(takeCall().startsWith("MessageCenter.registerNotify"));
    auto& notify = peer<IMessageCenterNotify>();
    notify.getTopWindowNotify(1);
    notify.postMessageNotify({4, 2, -1, L"f", TEXT, 117});
    notify.closeMessageNotify({4, 2, 117});
    notify.showBarNotify(3);
    QCOMPARE(m_client.take(), "getTopWindowNotify(1)|postMessageNotify(4,2,-1,f," + QTEXT +
                                  ",117)|closeMessageNotify(4,2,117)|showBarNotify(3)");
}

void tst_servicetable::powerManager()
{
    auto* power = service<IPowerManager>(71);
    power->closeClient(2);
    QCOMPARE(takeCall(), R"(PowerManager.closeClient {"clientId":2})");
    power->unregisterCallBack(2);
    QCOMPARE(takeCall(), R"(PowerManager.unregisterCallBack {"clientId":2})");
    power->unregisterNotify(2);
    QCOMPARE(takeCall(), R"(PowerManager.unregisterNotify {"clientId":2})");
    power->inProcessing();
    QCOMPARE(takeCall(), "PowerManager.inProcessing {}");
    power->powerOff();
    QCOMPARE(takeCall(), "PowerManager.powerOff {}");
    power->willPowerOff();
    QCOMPARE(takeCall(), "PowerManager.willPowerOff {}");
    power->registerCallBack(&m_client);
    QVERIFY(takeCall().startsWith("PowerManager.registerCallBack"));
    peer<IPowerManagerCallBack>().getClientID(3);
    QCOMPARE(m_client.take(), "getClientID(3)");
    power->registerNotify({&m_client, 3});
    QVERIFY(takeCall().startsWith("PowerManager.registerNotify"));
    peer<IPowerManagerNotify>().powerOff();
    peer<IPowerManagerNotify>().powerOn();
    QCOMPARE(m_client.take(), "powerOff()|powerOn()");
}

void tst_servicetable::projectDataManager()
{
    auto* project = service<IProjectDataManager>(76);
    project->unregisterCallBack(2);
    QCOMPARE(takeCall(), R"(ProjectDataManager.unregisterCallBack {"clientId":2})");
    project->unregisterNotifyCallBack(2);
    QCOMPARE(takeCall(), R"(ProjectDataManager.unregisterNotifyCallBack {"clientId":2})");
    project->registerCallBack(&m_client);
    QVERIFY(takeCall().startsWith("ProjectDataManager.registerCallBack"));
    peer<IProjectDataManagerCallBack>().getClientID(3);
    QCOMPARE(m_client.take(), "getClientID(3)");
    project->registerNotifyCallBack({&m_client, 3});
    QVERIFY(takeCall().startsWith("ProjectDataManager.registerNotifyCallBack"));
    peer<IProjectDataManagerNotify>().loadNotify(2);
    QCOMPARE(m_client.take(), "loadNotify(2)");
}

void tst_servicetable::showTitlerController()
{
    auto* controller = service<IShowTitlerController>(92);
    controller->setFolderStatus({1, TEXT});
    QCOMPARE(takeCall(), "ShowTitlerController.setFolderStatus {\"path\":\"" + QTEXT + "\",\"type\":1}");
    controller->registerCallBack(&m_client);
    QVERIFY(takeCall().startsWith("ShowTitlerController.registerCallBack"));
    peer<IShowTitlerControllerCallBack>().showTitler();
    QCOMPARE(m_client.take(), "showTitler()");
}

void tst_servicetable::softKeyBoard()
{
    auto* keyboard = service<ISoftKeyBoardController>(95);
    keyboard->show({1, L"title", 2, 20, TEXT, 9, 0, 9, 2, L"^.*$", 300});
    QCOMPARE(takeCall(),
             "SoftKeyBoardController.show {\"fieldKind\":1,\"keyboardType\":2,\"lastValue\":300,"
             "\"limitCondition\":\"^.*$\",\"maxLength\":20,\"selectionEnd\":9,\"selectionMode\":2,"
             "\"selectionStart\":0,\"text\":\"" +
                 QTEXT + "\",\"textLength\":9,\"title\":\"title\"}");
    const std::pair<const char*, void (ISoftKeyBoardController::*)()> plain[] = {
        {"close", &ISoftKeyBoardController::close},
        {"dummyClose", &ISoftKeyBoardController::dummyClose},
        {"simpleClose", &ISoftKeyBoardController::simpleClose},
        {"closeLimitBalloon", &ISoftKeyBoardController::closeLimitBalloon},
        {"showMask", &ISoftKeyBoardController::showMask},
        {"hideMask", &ISoftKeyBoardController::hideMask},
    };
    for (const auto& [name, method] : plain) {
        (keyboard->*method)();
        QCOMPARE(takeCall(), QString("SoftKeyBoardController.") + name + " {}");
    }
    keyboard->sendKey({6, 65, 1, L"A", true, 66});
    QCOMPARE(takeCall(),
             R"(SoftKeyBoardController.sendKey {"autoRepeat":true,"eventType":6,"key":65,"modifiers":1,)"
             R"("nativeVirtualKey":66,"text":"A"})");
    keyboard->sendLimitInfo({L"one", L"two", 4002});
    QCOMPARE(takeCall(),
             R"(SoftKeyBoardController.sendLimitInfo {"code":4002,"secondText":"two","text":"one"})");
    keyboard->registerCallBack(&m_client);
    QVERIFY(takeCall().startsWith("SoftKeyBoardController.registerCallBack"));
    auto& client = peer<ISoftKeyBoardControllerCallBack>();
    client.sendInputString(TEXT);
    client.sendInputStringOnEnterPressing(L"e");
    client.sendInputStringOnTextChanged(L"");
    client.sendKey({6, 65, 0, L"a", false, 3});
    client.sendInputStringSelectionPos({1, 2, 3, 0});
    client.sendSoftKeyboardState(true);
    QCOMPARE(m_client.take(), "sendInputString(" + QTEXT +
                                  ")|sendInputStringOnEnterPressing(e)|sendInputStringOnTextChanged()|"
                                  "sendKey(6,65,0,a,false,3)|sendInputStringSelectionPos(1,2,3,0)|"
                                  "sendSoftKeyboardState(true)");
}

void tst_servicetable::systemSetupManager()
{
    auto* setup = service<ISystemSetupManager>(114);
    setup->getLanguageInfo(8);
    QCOMPARE(takeCall(), R"(SystemSetupManager.getLanguageInfo {"clientId":8})");
    setup->getInformation(8);
    QCOMPARE(takeCall(), R"(SystemSetupManager.getInformation {"clientId":8})");
    setup->unregisterCallBack(8);
    QCOMPARE(takeCall(), R"(SystemSetupManager.unregisterCallBack {"clientId":8})");
    setup->unregisterNotifyCallBack(8);
    QCOMPARE(takeCall(), R"(SystemSetupManager.unregisterNotifyCallBack {"clientId":8})");
    setup->registerCallBack(&m_client);
    QVERIFY(takeCall().startsWith("SystemSetupManager.registerCallBack"));
    auto& client = peer<ISystemSetupManagerCallBack>();
    client.getClientID(8);
    client.getLanguageInfoCallBack({-1, 2, 9});
    client.getInformationCallBack({1});
    QCOMPARE(m_client.take(), "getClientID(8)|getLanguageInfoCallBack(-1,2,9)|getInformationCallBack(1)");
    setup->registerNotifyCallBack({&m_client, 8});
    QVERIFY(takeCall().startsWith("SystemSetupManager.registerNotifyCallBack"));
    peer<ISystemSetupManagerNotify>().setSystemLanguageNotify(2);
    peer<ISystemSetupManagerNotify>().setInputLanguageNotify(10);
    QCOMPARE(m_client.take(), "setSystemLanguageNotify(2)|setInputLanguageNotify(10)");
}

void tst_servicetable::callsWithoutParametersCarryFourBytes()
{
    auto* keyboard = service<ISoftKeyBoardController>(95);
    keyboard->close();
    QCOMPARE(m_toServer->lastSize, 4L);
    QCOMPARE(takeCall(), "SoftKeyBoardController.close {}");
    auto* power = service<IPowerManager>(71);
    power->registerNotify({&m_client, 1});
    takeCall();
    peer<IPowerManagerNotify>().powerOff();
    QCOMPARE(m_toClient->lastSize, 4L);
    QCOMPARE(m_client.take(), "powerOff()");
}

void tst_servicetable::unknownMethodsLeaveTheTargetAlone()
{
    for (const ServiceTable::Service& entry : ServiceTable::services()) {
        for (const long type : {entry.callBackAdapter, entry.notifyAdapter}) {
            const std::unique_ptr<PTC::IAdapterBase> adapter(ServiceFamilies::createAdapter(type, 1));
            if (adapter == nullptr)
                continue;
            char payload[4] = {};
            adapter->setTarget(reinterpret_cast<void*>(1)); // a call through it would crash
            for (const long method : {0L, -1L, 99L, 1L << 40}) {
                PTC::Event event(1, method, payload, sizeof payload, true, true);
                adapter->receive(&event);
            }
        }
    }
    for (const ServiceDescription& description : describeServices()) {
        for (const long method : {0L, -1L, 99L, 1L << 40}) {
            char payload[4] = {};
            PTC::Event event(description.interfaceId, method, payload, sizeof payload, true, false);
            m_server->handleEvent(&event);
        }
    }
    QVERIFY(m_calls.isEmpty());
}

void tst_servicetable::adaptersWithoutTarget()
{
    int adapters = 0;
    for (long type = 0; type < 130; ++type) {
        const std::unique_ptr<PTC::IAdapterBase> adapter(ServiceFamilies::createAdapter(type, 1));
        char payload[4] = {};
        PTC::Event event(1, 1, payload, sizeof payload, true, true);
        if (adapter != nullptr) {
            ++adapters;
            adapter->receive(&event);
        }
    }
    QCOMPARE(adapters, 14);
}

void tst_servicetable::randomPayloadsReachNothingBad()
{
    const RandomSeed seed(4711);
    std::mt19937 random(seed);
    const auto bombard = [&](PTC::IAdapterBase& adapter) {
        for (int round = 0; round < 300; ++round) {
            const long size = static_cast<long>(random() % 40) + 1;
            const std::unique_ptr<char[]> payload(new char[static_cast<std::size_t>(size)]);
            for (long i = 0; i < size; ++i)
                payload[static_cast<std::size_t>(i)] = static_cast<char>(random());
            PTC::Event event(1, static_cast<long>(random() % 12), payload.get(), size, true, true);
            adapter.receive(&event);
        }
    };
    const std::pair<long, void*> targets[] = {
        {2, static_cast<IAPPEventFilterCallBack*>(&m_client)},
        {3, static_cast<IAPPEventFilterNotify*>(&m_client)},
        {37, static_cast<IFileManagerControllerCallBack*>(&m_client)},
        {38, static_cast<IFileManagerControllerNotify*>(&m_client)},
        {66, static_cast<IMessageCenterCallBack*>(&m_client)},
        {67, static_cast<IMessageCenterNotify*>(&m_client)},
        {72, static_cast<IPowerManagerCallBack*>(&m_client)},
        {73, static_cast<IPowerManagerNotify*>(&m_client)},
        {77, static_cast<IProjectDataManagerCallBack*>(&m_client)},
        {78, static_cast<IProjectDataManagerNotify*>(&m_client)},
        {93, static_cast<IShowTitlerControllerCallBack*>(&m_client)},
        {96, static_cast<ISoftKeyBoardControllerCallBack*>(&m_client)},
        {115, static_cast<ISystemSetupManagerCallBack*>(&m_client)},
        {116, static_cast<ISystemSetupManagerNotify*>(&m_client)},
    };
    for (const auto& [type, target] : targets) {
        const std::unique_ptr<PTC::IAdapterBase> adapter(ServiceFamilies::createAdapter(type, 1));
        adapter->setTarget(target);
        bombard(*adapter);
        QVERIFY(!m_client.take().isEmpty());
    }
    FakeTitler titler;
    TitlerAdapter titlerAdapter(117);
    titlerAdapter.setTarget(static_cast<ITitler*>(&titler));
    bombard(titlerAdapter);
    QVERIFY(!titler.calls.isEmpty());
}

void tst_servicetable::titler()
{
    FakeTitler titler;
    auto* adapter = new TitlerAdapter(117);
    adapter->setTarget(static_cast<ITitler*>(&titler));
    adapter->setProxyFactory(this);
    m_server->addAdapter(adapter);
    TitlerRemoteProxy proxy(117);
    proxy.setSender(m_toServer.get());
    proxy.setReceiver(m_clientReceiver.get());
    proxy.setAdapterFactory(this);
    Answers answers;
    FakeTitlerCallBack callBack(answers);
    proxy.registerCallBack(&callBack);
    proxy.showTitlerCreate(7);
    proxy.showTitlerEdit({8, TEXT});
    proxy.showDialogMaskWidget(true);
    proxy.showMessageMaskWidget(false);
    QCOMPARE(titler.calls,
             (QStringList{"registerCallBack", "create 7", "edit 8 " + QTEXT, "dialog 1", "message 0"}));
    simplebuffer paths = TitlerParams::serialize_showTitlerEdit_param({0, L""}); // not a list of texts
    titler.callBack->finishTitlerCreateCallback({7, TEXT, paths.data, static_cast<int>(paths.size), 0});
    QCOMPARE(answers.last.type, 7);
    QVERIFY(answers.last.path == TEXT);
    QCOMPARE(answers.last.count, 0);
    QVERIFY(answers.paths.isEmpty());
    CSimpleBuffer::simplebuffer_destroy(&paths);
}

void tst_servicetable::titlerRegistrationWithinTheProcess()
{
    FakeTitler titler;
    TitlerAdapter adapter(117);
    adapter.setTarget(static_cast<ITitler*>(&titler));
    adapter.setProxyFactory(this);
    char* data = new char[sizeof(int)];
    const int id = 3;
    std::memcpy(data, &id, sizeof id);
    PTC::Event event(117, TitlerAdapter::METHOD_registerCallBack, data, sizeof id, false, false);
    adapter.receive(&event);
    QVERIFY(event.getData() == nullptr); // freed by the adapter
    PTC::Event shortEvent(117, TitlerAdapter::METHOD_registerCallBack, new char[1]{}, 1, false, false);
    adapter.receive(&shortEvent);
    QVERIFY(titler.calls.isEmpty()); // there is no client number 0; the earlier registration stays
}

void tst_servicetable::titlerUnknownMethods()
{
    FakeTitler titler;
    TitlerAdapter adapter(117);
    adapter.setTarget(static_cast<ITitler*>(&titler));
    for (const long method : {0L, 6L, -1L}) {
        char payload[4] = {};
        PTC::Event event(117, method, payload, 4, true, false);
        adapter.receive(&event);
    }
    QVERIFY(titler.calls.isEmpty());
}

void tst_servicetable::tableOfServices()
{
    QCOMPARE(ServiceTable::services().size(), std::size_t(42));
    std::set<long> adapterTypes;
    long last = 0;
    for (const ServiceTable::Service& service : ServiceTable::services()) {
        QVERIFY(service.interfaceId > last);
        last = service.interfaceId;
        QVERIFY(service.methods > 0);
        QCOMPARE(service.port, service.clientKey == 3 ? 1002L : 1000L);
        QVERIFY(ServiceTable::findByInterface(service.interfaceId) == &service);
        for (const long type : {service.callBackAdapter, service.notifyAdapter})
            if (type != ServiceTable::NO_ADAPTER)
                QVERIFY(adapterTypes.insert(type).second);
    }
    QCOMPARE(adapterTypes.size(), std::size_t(63));
    for (const long unknown : {0L, 117L, 118L, 2L, -1L, 1000L})
        QVERIFY(ServiceTable::findByInterface(unknown) == nullptr);
    for (const long unknown : {0L, 1L, 117L, 118L, 39L})
        QVERIFY(!adapterTypes.contains(unknown));
    QCOMPARE(QString(ServiceTable::findByInterface(110)->name), "SubPanelController");
    QCOMPARE(ServiceTable::findByInterface(110)->methods, 54);
    QCOMPARE(ServiceTable::findByInterface(110)->notifyAdapter, 111L);
}

void tst_servicetable::familiesOfServices()
{
    int families = 0;
    for (long id = -1; id < 200; ++id) {
        void* instance = this;
        const std::unique_ptr<PTC::Proxy> proxy(ServiceFamilies::createProxy(id, &instance));
        if (proxy == nullptr) {
            QVERIFY(instance == this);
            continue;
        }
        ++families;
        QCOMPARE(proxy->getId(), id);
        QVERIFY(instance != this && instance != nullptr);
    }
    QCOMPARE(families, 8);
}

void tst_servicetable::senderKeys()
{
    const long keys[] = {1, 2, 3, 4, 5, 6, 4, 7, 8};
    for (long client = 1000; client <= 1008; ++client)
        QCOMPARE(ServiceTable::senderKeyOf(client), keys[client - 1000]);
    for (const long other : {0L, -1L, 999L, 1009L, 1L << 40}) {
        QCOMPARE(ServiceTable::senderKeyOf(other), 4L);
        QVERIFY(!ServiceTable::isSibling(other));
    }
    for (long client = 1000; client <= 1008; ++client)
        QCOMPARE(ServiceTable::isSibling(client), client != 1003); // the client number of this process
}

QTEST_GUILESS_MAIN(tst_servicetable)
#include "tst_servicetable.moc"

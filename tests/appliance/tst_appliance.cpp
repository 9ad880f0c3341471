// The appliance program, driven over its lines, with a titler on the messaging library as its client.
#include "messaging/ptc/InstanceFactory.h"
#include "messaging/ptc/Proxy.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/RecordPacking.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"
#include "messaging/services/TitlerAdapter.h"
#include "tests/fakes/FakeTitler.h"
#include "tests/messaging/TestPorts.h"
#include "tests/support/Patience.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QTest>

#include <csignal>
#include <memory>

namespace
{

QString say(const std::wstring& text)
{
    return QString::fromStdWString(text);
}

// A titler without windows: it listens, registers at the services it is told to, and writes down what it is
// told.
class SmallTitler : public PTC::InstanceFactory,
                    public FakeTitler,
                    public IAPPEventFilterCallBack,
                    public IAPPEventFilterNotify,
                    public IMessageCenterCallBack,
                    public IMessageCenterNotify,
                    public IShowTitlerControllerCallBack,
                    public ISoftKeyBoardControllerCallBack,
                    public ISystemSetupManagerCallBack
{
public:
    bool initialize() override
    {
        m_receiver = new PTC::QtReceiver(ServiceTable::TITLER_CLIENT_KEY);
        auto* adapter = new TitlerAdapter(TitlerAdapter::INTERFACE_ID);
        adapter->setTarget(static_cast<ITitler*>(this));
        adapter->setProxyFactory(this);
        m_receiver->addAdapter(adapter);
        auto* remote = new SocketRemoteReceiver(0);
        remote->addReceiver(m_receiver);
        setRemoteReceiver(remote);
        return remote->initialize(ServiceTable::TITLER_CLIENT);
    }
    void createInstance(long id, void** instance) override
    {
        const ServiceTable::Service* service = ServiceTable::findByInterface(id);
        if (findSender(service->clientKey) == nullptr) {
            auto* sender = new SocketRemoteSender(service->clientKey);
            connected = sender->initialize(service->port) && connected;
            addSender(sender);
        }
        m_proxies.emplace_back(ServiceFamilies::createProxy(id, instance));
        m_proxies.back()->setSender(findSender(service->clientKey));
        m_proxies.back()->setReceiver(m_receiver);
        m_proxies.back()->setAdapterFactory(this);
    }
    template <typename Interface>
    Interface* service(long id)
    {
        void* instance = nullptr;
        createInstance(id, &instance);
        return static_cast<Interface*>(instance);
    }
    PTC::IAdapterBase* createAdapter(long type, PTC::IReceiver* receiver, void* target) override
    {
        PTC::IAdapterBase* adapter = ServiceFamilies::createAdapter(type, m_nextAdapter++);
        adapter->setTarget(target);
        receiver->addCBAdapter(adapter);
        return adapter;
    }
    PTC::IProxyBase* createProxy(long, long id, long client) override
    {
        PTC::ISender* sender = findSender(ServiceTable::senderKeyOf(client));
        auto* proxy = new TitlerCallBackRemoteProxy(id);
        proxy->setSender(sender);
        return proxy;
    }

    void setClientID(int id) override { calls.append(QString("client id %1").arg(id > 0)); }
    void getClientID(int id) override { calls.append(QString("client id %1").arg(id > 0)); }
    void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent e) override
    {
        calls.append(QString("lock %1 %2 %3").arg(e.lockType).arg(e.flag).arg(e.eventReceiver));
    }
    void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent) override
    {
        calls.append("restore original");
    }
    void postRestoreFocusNotify() override { calls.append("restore focus"); }
    void getTopWindowCallBack(int top) override { calls.append(QString("top window answer %1").arg(top)); }
    void getTopWindowNotify(int top) override { calls.append(QString("top window %1").arg(top)); }
    void postMessageNotify(MessageDefine::_tagMessageParam p) override
    {
        calls.append(QString("message %1 %2").arg(p.messageId).arg(say(p.text)));
    }
    void closeMessageNotify(MessageDefine::_tagCloseParam p) override
    {
        calls.append(QString("close message %1 %2").arg(p.messageId).arg(p.closeType));
    }
    void showBarNotify(int) override {}
    void showTitler() override { calls.append("show titler"); }
    void sendInputString(std::wstring t) override { calls.append("string " + say(t)); }
    void sendInputStringOnEnterPressing(std::wstring t) override { calls.append("enter " + say(t)); }
    void sendInputStringOnTextChanged(std::wstring t) override { calls.append("changed " + say(t)); }
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData k) override
    {
        calls.append(
            QString("key %1 %2 %3 %4").arg(k.eventType).arg(k.key).arg(k.modifiers).arg(say(k.text)));
    }
    void sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos p) override
    {
        calls.append(QString("cursor %1 %2 %3 %4").arg(p.begin).arg(p.end).arg(p.current).arg(p.mode));
    }
    void sendSoftKeyboardState(bool shown) override { calls.append(QString("keyboard %1").arg(shown)); }
    void getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam p) override
    {
        calls.append(QString("language %1 %2").arg(p.systemLanguage).arg(p.inputLanguage));
    }
    void getInformationCallBack(SystemSetupDef::tagSystemInformation p) override
    {
        calls.append(QString("module %1").arg(p.model));
    }

    bool connected = true;

private:
    PTC::QtReceiver* m_receiver = nullptr;
    std::vector<std::unique_ptr<PTC::Proxy>> m_proxies;
    long m_nextAdapter = 0;
};

} // namespace

class tst_appliance : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { TestPorts::useFreeOffset(); }
    void init();
    void cleanup();
    void errorsAreAnswered();
    void portTaken();
    void endOfInputEnds();
    void staysWhenAsked();
    void titlerRequests();
    void createSessionResult();
    void languageAndModule();
    void messages();
    void keyboard();
    void keyboardOptions();
    void locks();
    void subPanel();
    void waits();
    void titlerStartedAnew();

private:
    void command(const QByteArray& line) { m_appliance->write(line + '\n'); }
    // The next event of that kind, with those before it skipped.
    QJsonObject event(const QString& kind);
    void expect(const QStringList& calls);

    std::unique_ptr<QProcess> m_appliance;
    std::unique_ptr<SmallTitler> m_titler;
};

void tst_appliance::init()
{
    m_appliance = std::make_unique<QProcess>();
    m_appliance->setProcessChannelMode(QProcess::ForwardedErrorChannel);
    m_appliance->start(APPLIANCE_PROGRAM, QStringList());
    QVERIFY(m_appliance->waitForStarted());
    QCOMPARE(event("ready"), (QJsonObject{{"event", "ready"}}));
    m_titler = std::make_unique<SmallTitler>();
    QVERIFY(m_titler->initialize());
}

void tst_appliance::cleanup()
{
    m_titler.reset();
    if (m_appliance->state() != QProcess::NotRunning) {
        command("quit");
        QVERIFY(m_appliance->waitForFinished());
        QCOMPARE(m_appliance->exitStatus(), QProcess::NormalExit);
        QCOMPARE(m_appliance->exitCode(), 0);
    }
    m_appliance.reset();
}

QJsonObject tst_appliance::event(const QString& kind)
{
    QDeadlineTimer deadline(20000);
    while (!deadline.hasExpired()) {
        while (m_appliance->canReadLine()) {
            const QJsonObject json = QJsonDocument::fromJson(m_appliance->readLine()).object();
            if (json["event"] == kind)
                return json;
        }
        QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
        m_appliance->waitForReadyRead(10);
    }
    return {};
}

void tst_appliance::expect(const QStringList& calls)
{
    QTRY_VERIFY(m_titler->calls.size() >= calls.size());
    QCOMPARE(m_titler->calls, calls);
    m_titler->calls.clear();
}

void tst_appliance::errorsAreAnswered()
{
    const QPair<QByteArray, QString> lines[] = {
        {"bogus", "unknown command"},
        {"create many", "a number is missing or wrong"},
        {"message-close 117 2", "MessageCenter has no client"},
        {"string x", "SoftKeyBoardController has no client"},
        {"wait-call OnlyOne", "wrong number of arguments"},
        {"wait-result soon", "a number is missing or wrong"},
        {"key-echo perhaps", "on or off"},
        {"language 1", "a number is missing or wrong"},
        {QByteArray(100000, 'x'), "unknown command"},
        {"\xff\xfe", "unknown command"},
    };
    for (const auto& [line, message] : lines) {
        command(line);
        QCOMPARE(event("error")["message"].toString(), message);
    }
    command("");
    command("# a remark");
    command("module 0");
    QCOMPARE(event("ok")["command"].toString(), "module 0");
}

void tst_appliance::portTaken()
{
    QProcess second;
    second.start(APPLIANCE_PROGRAM, QStringList());
    QVERIFY(second.waitForFinished());
    QCOMPARE(second.exitCode(), 1);
    QVERIFY(second.readAllStandardOutput().contains("a port cannot be bound"));
}

void tst_appliance::endOfInputEnds()
{
    command("wait-call MessageCenter postMessage 100");
    m_appliance->closeWriteChannel();
    QCOMPARE(event("timeout")["command"].toString(), "wait-call MessageCenter postMessage 100");
    QVERIFY(m_appliance->waitForFinished());
    QCOMPARE(m_appliance->exitCode(), 0);
}

void tst_appliance::staysWhenAsked()
{
    command("quit");
    QVERIFY(m_appliance->waitForFinished());
    m_appliance->start(APPLIANCE_PROGRAM, {"--stay"});
    QCOMPARE(event("ready")["event"].toString(), "ready");
    m_appliance->closeWriteChannel();
    QVERIFY(!m_appliance->waitForFinished(300));
    kill(static_cast<pid_t>(m_appliance->processId()), SIGTERM);
    QVERIFY(m_appliance->waitForFinished());
    QCOMPARE(m_appliance->exitStatus(), QProcess::NormalExit);
    QCOMPARE(m_appliance->exitCode(), 0);
}

void tst_appliance::titlerRequests()
{
    command("wait-titler");
    QCOMPARE(event("ok")["command"].toString(), "wait-titler");
    command("create");
    command("create 5");
    command("edit /plain.xml");
    command("edit /plain.xml 3");
    command("edit /with blank/速報.xml");
    command("edit \"/with blank/속보 é.xml\" 4");
    command("edit");
    command("dialog-mask 1");
    command("message-mask 0");
    expect({"create 0", "create 5", "edit 0 /plain.xml", "edit 3 /plain.xml",
            QString::fromUtf8("edit 0 /with blank/速報.xml"),
            QString::fromUtf8("edit 4 /with blank/속보 é.xml"), "edit 0 ", "dialog 1", "message 0"});
}

void tst_appliance::createSessionResult()
{
    m_titler->service<IMessageCenter>(65); // the connection that the answer takes
    command("register");
    command("create 7");
    expect({"registerCallBack", "create 7"});
    simplebuffer paths;
    RecordPacking::pack(&paths, std::wstring(L"/資料/1.xml"));
    RecordPacking::pack(&paths, std::wstring(L"/資料/2.xml"));
    m_titler->callBack->finishTitlerCreateCallback(
        {7, L"/資料", paths.data, static_cast<int>(paths.size), 2});
    command("wait-result");
    const QJsonObject result = event("result");
    QCOMPARE(result["type"].toInt(), 7);
    QCOMPARE(result["path"].toString(), QString::fromUtf8("/資料"));
    QCOMPARE(result["size"].toInt(), static_cast<int>(paths.size));
    QCOMPARE(result["count"].toInt(), 2);
    QCOMPARE(result["paths"].toArray(),
             (QJsonArray{QString::fromUtf8("/資料/1.xml"), QString::fromUtf8("/資料/2.xml")}));
    CSimpleBuffer::simplebuffer_destroy(&paths);
    command("wait-result 50"); // there is no second result
    QCOMPARE(event("timeout")["command"].toString(), "wait-result 50");
}

void tst_appliance::languageAndModule()
{
    command("language 2 9");
    command("module 1");
    event("ok");
    event("ok");
    auto* setup = m_titler->service<ISystemSetupManager>(114);
    setup->registerCallBack(m_titler.get());
    expect({"client id 1"});
    setup->getInformation(1);
    setup->getLanguageInfo(1);
    expect({"module 1", "language 2 9"});
    command("language 1 8");
    command("module 0");
    command("system-language 2");
    command("input-language 7");
    event("ok");
    expect({"language 1 8", "module 0"});
    setup->getLanguageInfo(1);
    expect({"language 2 7"});
}

void tst_appliance::messages()
{
    auto* center = m_titler->service<IMessageCenter>(65);
    center->registerCallBack(m_titler.get());
    expect({"client id 1"});
    center->registerNotify({m_titler.get(), 1});
    center->setTopWindow({1, 1});
    center->getTopWindow(1);
    center->postMessage({1, 2, -1, L"", L"フォント", 109});
    expect({"top window 1", "top window answer 1", QString::fromUtf8("message 109 フォント")});
    command("wait-call MessageCenter postMessage");
    const QJsonObject call = event("waited-call");
    QCOMPARE(call["args"].toObject()["messageId"].toInt(), 109);
    QCOMPARE(call["args"].toObject()["text"].toString(), QString::fromUtf8("フォント"));
    command("message-close 117 2");
    command("top-window 2");
    expect({"close message 117 2", "top window 2"});
    center->unregisterNotify(999); // the notify of another client
    command("wait-call MessageCenter unregisterNotify");
    event("waited-call");
    command("message-close 117 1");
    expect({"close message 117 1"});
}

void tst_appliance::keyboard()
{
    auto* service = m_titler->service<ISoftKeyBoardController>(95);
    service->registerCallBack(m_titler.get());
    command("wait-call SoftKeyBoardController registerCallBack");
    QCOMPARE(event("waited-call")["method"].toString(), "registerCallBack");
    command("string Breaking 快讯 ");
    command("string-enter \" quoted \\\" \"");
    command("string-changed");
    command("key Return");
    command("key aÉ속");
    command("key-text Up");
    command("key Ctrl+Z");
    command("key-close");
    command("cursor 1 2 3 0");
    command("keyboard-state 1");
    expect({QString::fromUtf8("string Breaking 快讯 "),
            "enter  quoted \" ",
            "changed ",
            "key 6 16777220 0 \r",
            "key 7 16777220 0 \r",
            "key 6 65 0 a",
            "key 7 65 0 a",
            QString::fromUtf8("key 6 201 33554432 É"),
            QString::fromUtf8("key 7 201 33554432 É"),
            QString::fromUtf8("key 6 49549 0 속"),
            QString::fromUtf8("key 7 49549 0 속"),
            "key 6 85 33554432 U",
            "key 7 85 33554432 U",
            "key 6 80 0 p",
            "key 7 80 0 p",
            "key 6 90 67108864 ",
            "key 7 90 67108864 ",
            "key 1100 0 0 ",
            "cursor 1 2 3 0",
            "keyboard 1"});
}

void tst_appliance::keyboardOptions()
{
    auto* service = m_titler->service<ISoftKeyBoardController>(95);
    service->registerCallBack(m_titler.get());
    service->sendKey({6, 65, 0, L"a", false, 0});
    service->close();
    service->dummyClose();
    service->simpleClose();
    expect({"key 6 65 0 a", "keyboard 0", "keyboard 0", "keyboard 0"});
    command("key-echo off");
    command("state-on-close off");
    event("ok");
    event("ok");
    service->sendKey({6, 65, 0, L"a", false, 0});
    service->close();
    command("wait-call SoftKeyBoardController close");
    command("wait-call SoftKeyBoardController close");
    event("waited-call");
    event("waited-call");
    command("keyboard-state 1");
    expect({"keyboard 1"});
}

void tst_appliance::locks()
{
    auto* filter = m_titler->service<IAPPEventFilter>(1);
    filter->registerCallBack(m_titler.get());
    expect({"client id 1"});
    filter->registerNotify({m_titler.get(), 1});
    filter->postAPPEventFilter({1, 2, true, 3});
    expect({"lock 2 1 3"});
    command("lock 1 1 4");
    command("restore-original");
    command("restore-focus");
    expect({"lock 1 1 4", "restore original", "restore focus"});
    command("event-echo off");
    command("count APPEventFilter postAPPEventFilter");
    QCOMPARE(event("count")["count"].toInt(), 1);
    filter->postAPPEventFilter({1, 2, false, 3});
    filter->postRestoreFocus();
    command("wait-call APPEventFilter postRestoreFocus");
    event("waited-call");
    command("lock 1 0 4");
    expect({"lock 1 0 4"});
    command("clear");
    command("count APPEventFilter postAPPEventFilter");
    QCOMPARE(event("count")["count"].toInt(), 0);
}

void tst_appliance::subPanel()
{
    auto* controller = m_titler->service<IShowTitlerController>(92);
    controller->registerCallBack(m_titler.get());
    controller->setFolderStatus({2, L"/資料"});
    command("wait-call ShowTitlerController setFolderStatus");
    QCOMPARE(event("waited-call")["args"].toObject()["path"].toString(), QString::fromUtf8("/資料"));
    command("sub");
    expect({"show titler"});
}

void tst_appliance::waits()
{
    command("wait-call MessageCenter showBar 60");
    command("module 1"); // held back until the wait is over
    QCOMPARE(event("timeout")["command"].toString(), "wait-call MessageCenter showBar 60");
    QCOMPARE(event("ok")["command"].toString(), "module 1");
    command("wait-call MessageCenter showBar");
    m_titler->service<IMessageCenter>(65)->showBar(4);
    QCOMPARE(event("call")["args"].toObject()["bar"].toInt(), 4);
    QCOMPARE(event("waited-call")["args"].toObject()["bar"].toInt(), 4);
    m_titler.reset();
    command("wait-titler 60");
    QCOMPARE(event("timeout")["command"].toString(), "wait-titler 60");
    command("create");
    QCOMPARE(event("error")["message"].toString(), "the titler does not listen");
}

void tst_appliance::titlerStartedAnew()
{
    command("create 1");
    expect({"create 1"});
    m_titler = std::make_unique<SmallTitler>();
    QTRY_VERIFY(m_titler->initialize());
    auto* center = m_titler->service<IMessageCenter>(65);
    center->registerCallBack(m_titler.get());
    expect({"client id 1"});
    command("create 2");
    expect({"create 2"});
}

QTEST_GUILESS_MAIN(tst_appliance)
#include "tst_appliance.moc"

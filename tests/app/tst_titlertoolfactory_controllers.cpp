// The controllers against siblings that record: hand-shake, requests, notices and their filters.
#include "Siblings.h"
#include "app/EarlyRequests.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/ShowTitlerController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "app/TitlerPowerController.h"
#include "app/TitlerProjectDataController.h"
#include "app/TitlerToolFactory.h"
#include "messaging/ptc/IAdapterBase.h"
#include "messaging/ptc/IProxyBase.h"
#include "messaging/services/ServiceFamilies.h"
#include "tests/support/Patience.h"

#include <QSignalSpy>
#include <QTest>
#include <QThread>
#include <QWidget>
#include <memory>

namespace
{

constexpr long APP_EVENT_FILTER = 1;
constexpr long FILE_MANAGER = 36;
constexpr long MESSAGE_CENTER = 65;
constexpr long POWER_MANAGER = 71;
constexpr long PROJECT_DATA = 76;
constexpr long SHOW_TITLER = 92;
constexpr long SYSTEM_SETUP = 114;

using Methods = QList<long>;

} // namespace

class tst_titlertoolfactory_controllers : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void init() { m_siblings.forget(); }

    void factoryKnowsOnlyItsServices();
    void adapterIdsNeverGoBack();
    void setupHandShakeAsksForModelAndLanguages();
    void setupTellsLanguages();
    void setupIgnoresASecondFactory();
    void fileManagerReportsFoldersAndTitles();
    void fileManagerReportsFromOtherThreads();
    void importNoticesByFileType();
    void deleteNoticesOnlyOfTemplates();
    void renameNoticesOnlyOfTemplates();
    void ownLockEventsHaveNoEffect();
    void restoreOriginalIsTold();
    void projectLoadAsksForLanguages_data();
    void projectLoadAsksForLanguages();
    void powerEventsAreSignals();
    void messageCarriesItsNumberAndText();
    void messagesWithoutServiceAreLost();
    void onTopFollowsTheService();
    void requestsWaitForTheLastClientId();
    void showTitlerIsMode1();

private:
    Siblings m_siblings;
    std::unique_ptr<TitlerToolFactory> m_factory;
};

void tst_titlertoolfactory_controllers::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    // Without the services a message has nowhere to go.
    messagesWithoutServiceAreLost();

    m_factory = std::make_unique<TitlerToolFactory>();
    QVERIFY(m_factory->initialize());
    ShowTitlerController::getInstance()->setFactory(m_factory.get());
    EditTitlerController::getInstance()->setFactory(m_factory.get());
    ShowMessageController::getInstance()->setFactory(m_factory.get());
    TitlerPowerController::getInstance()->setFactory(m_factory.get());
    TitlerProjectDataController::getInstance()->setFactory(m_factory.get());
    TitlerAPPEventFilterController::getInstance()->initialize(m_factory.get());
    for (const auto& [service, method] : QList<std::pair<long, long>>{{SHOW_TITLER, 2},
                                                                      {FILE_MANAGER, 78},
                                                                      {MESSAGE_CENTER, 8},
                                                                      {POWER_MANAGER, 7},
                                                                      {PROJECT_DATA, 9},
                                                                      {APP_EVENT_FILTER, 6}})
        QTRY_COMPARE(m_siblings.methodsOf(service), Methods{method});

    EditTitlerController::getInstance()->getClientID(11);
    ShowMessageController::getInstance()->setClientID(12);
    TitlerProjectDataController::getInstance()->getClientID(14);
    TitlerAPPEventFilterController::getInstance()->setClientID(15);
    QTRY_COMPARE(m_siblings.methodsOf(FILE_MANAGER), Methods({78, 79}));
    QTRY_COMPARE(m_siblings.methodsOf(MESSAGE_CENTER), Methods({8, 9}));
    QTRY_COMPARE(m_siblings.methodsOf(PROJECT_DATA), Methods({9, 10}));
    QTRY_COMPARE(m_siblings.methodsOf(APP_EVENT_FILTER), Methods({6, 7}));
}

void tst_titlertoolfactory_controllers::cleanupTestCase()
{
    m_siblings.forget();
    ShowTitlerController::clearInstance();
    SystemSetupInfoController::clearInstance();
    ShowMessageController::clearInstance();
    TitlerPowerController::clearInstance();
    TitlerProjectDataController::clearInstance();
    TitlerAPPEventFilterController::clearInstance();
    EditTitlerController::clearInstance();
    EarlyRequests::clearInstance();
    // Each took its leave of the service.
    QTRY_COMPARE(m_siblings.methodsOf(FILE_MANAGER), Methods({33, 34}));
    m_factory.reset();
}

void tst_titlertoolfactory_controllers::factoryKnowsOnlyItsServices()
{
    int untouched = 0;
    void* instance = &untouched;
    m_factory->createInstance(4711, &instance);
    QCOMPARE(instance, static_cast<void*>(&untouched));
    QVERIFY(!m_factory->createAdapter(4711, nullptr, nullptr));
    QVERIFY(!m_factory->createProxy(117, 1, 1000));
    QVERIFY(!m_factory->createProxy(118, 1, 1005)); // nobody listens there
    for (const long stranger : {0L, -1L, 1L, 999L, 1003L, 1009L, 64000L, 1L << 40})
        QVERIFY(!m_factory->createProxy(118, 1, stranger));
    std::unique_ptr<PTC::IProxyBase> proxy(m_factory->createProxy(118, 77, 1000));
    QVERIFY(proxy);
    QCOMPARE(proxy->getId(), 77L);
}

void tst_titlertoolfactory_controllers::adapterIdsNeverGoBack()
{
    PTC::Receiver receiver(9);
    const long first = m_factory->createAdapter(37, &receiver, nullptr)->getId();
    receiver.removeCBAdapter(first);
    const long second = m_factory->createAdapter(115, &receiver, nullptr)->getId();
    QCOMPARE(second, first + 1);
}

void tst_titlertoolfactory_controllers::setupHandShakeAsksForModelAndLanguages()
{
    SystemSetupInfoController* setup = SystemSetupInfoController::getInstance();
    setup->setFactory(m_factory.get());
    QTRY_COMPARE(m_siblings.methodsOf(SYSTEM_SETUP), Methods{64});
    setup->getClientID(10);
    QTRY_COMPARE(m_siblings.methodsOf(SYSTEM_SETUP), Methods({64, 65, 16, 1}));
    QCOMPARE(m_siblings.lastArguments(SYSTEM_SETUP, 16), QByteArray(1, '\x0a'));
}

void tst_titlertoolfactory_controllers::setupTellsLanguages()
{
    SystemSetupInfoController* setup = SystemSetupInfoController::getInstance();
    QSignalSpy input(setup, &SystemSetupInfoController::signalsInputLanguageInfo);
    QSignalSpy system(setup, &SystemSetupInfoController::signalsSystemLanguageInfo);
    QSignalSpy model(setup, &SystemSetupInfoController::signalsSystemInfo);
    setup->getLanguageInfoCallBack({1, 2, 9});
    QCOMPARE(input.size(), 1);
    QCOMPARE(input.last().first().value<SystemSetupDef::emInputLanguageType>(),
             SystemSetupDef::emInputLanguageChineseSimplified);
    QCOMPARE(system.last().first().value<SystemSetupDef::emSystemLanguageType>(),
             SystemSetupDef::emSystemLanguageChinese);
    setup->setInputLanguageNotify(7);
    QCOMPARE(input.size(), 2);
    QCOMPARE(system.size(), 1);
    setup->setSystemLanguageNotify(1);
    QCOMPARE(system.size(), 2);
    setup->getInputLanguage();
    QCOMPARE(input.last().first().value<SystemSetupDef::emInputLanguageType>(),
             SystemSetupDef::emInputLanguageJapanese);
    setup->getInformationCallBack({1});
    QCOMPARE(model.last().first().value<SystemSetupDef::emInformationModel>(),
             SystemSetupDef::emInformationModelChina);
}

void tst_titlertoolfactory_controllers::setupIgnoresASecondFactory()
{
    SystemSetupInfoController::getInstance()->setFactory(m_factory.get());
    // Another call shows that nothing was sent before it.
    SystemSetupInfoController::getInstance()->getModuleInfo();
    QTRY_COMPARE(m_siblings.methodsOf(SYSTEM_SETUP), Methods{16});
}

void tst_titlertoolfactory_controllers::fileManagerReportsFoldersAndTitles()
{
    EditTitlerController* files = EditTitlerController::getInstance();
    files->editFolderStartStatus("/t/a");
    files->editFolderEndStatus("/t/a");
    files->renameFolderStartStatus("/t/a");
    files->changeTitlerFolderName("/t/a", "/t/速報");
    files->updateTitlerOrder("/t/a");
    files->changeTitlerStatus(FileManagerDefine::TITLE_ADDED, "/t/a/1.xml");
    QTRY_COMPARE(m_siblings.methodsOf(FILE_MANAGER), Methods({75, 76, 73, 74, 77, 72}));

    QByteArray data = m_siblings.lastArguments(FILE_MANAGER, 74);
    FileManagerDefine::tagChangeFolderNameParam renamed;
    FileManagerControllerParams::deserialize_updateTitlerFolderName_param(renamed, data.data(), data.size());
    QCOMPARE(renamed.clientId, 11);
    QCOMPARE(renamed.newPath, std::wstring(L"/t/速報"));
    data = m_siblings.lastArguments(FILE_MANAGER, 72);
    FileManagerDefine::tagTitleChangeStatusParam changed;
    FileManagerControllerParams::deserialize_updateTitlerStatus_param(changed, data.data(), data.size());
    QCOMPARE(changed.changeType, 4);
}

void tst_titlertoolfactory_controllers::fileManagerReportsFromOtherThreads()
{
    std::unique_ptr<QThread> worker(QThread::create([] {
        ITitleChangeReporter::instance()->changeTitlerStatus(FileManagerDefine::TITLE_PICTURES_CHANGED,
                                                             "/t/2.xml");
    }));
    worker->start();
    QVERIFY(worker->wait());
    QTRY_COMPARE(m_siblings.methodsOf(FILE_MANAGER), Methods{72});
}

void tst_titlertoolfactory_controllers::importNoticesByFileType()
{
    EditTitlerController* files = EditTitlerController::getInstance();
    QSignalSpy fonts(files, &EditTitlerController::importNewFontFamilies);
    QSignalSpy templates(files, &EditTitlerController::importNewUserTemplate);
    FileManagerDefine::tagImportNotify notify;
    notify.path = L"new.ttf";
    notify.fileType = 6;
    files->importNotify(notify);
    QCOMPARE(fonts.size(), 1);
    QCOMPARE(fonts.first().first().toString(), QString("new.ttf"));
    notify.fileTypeHigh = 1; // both ints make one value
    files->importNotify(notify);
    QCOMPARE(fonts.size(), 1);
    notify.fileTypeHigh = 0;
    notify.fileType = 8;
    files->importNotify(notify);
    QCOMPARE(templates.size(), 1);
    notify.fileType = 7;
    files->importNotify(notify);
    QCOMPARE(fonts.size() + templates.size(), 2);
}

void tst_titlertoolfactory_controllers::deleteNoticesOnlyOfTemplates()
{
    EditTitlerController* files = EditTitlerController::getInstance();
    QSignalSpy spy(files, &EditTitlerController::deleteUserTemplate);
    FileManagerDefine::tagDeleteNotify notify;
    notify.path = L"/templates/UserTemplate_001";
    notify.fileType = 8;
    files->deleteNotify(notify);
    QCOMPARE(spy.size(), 1);
    notify.result = 1;
    files->deleteNotify(notify);
    notify.result = 0;
    notify.fileType = 6;
    files->deleteNotify(notify);
    QCOMPARE(spy.size(), 1);
}

void tst_titlertoolfactory_controllers::renameNoticesOnlyOfTemplates()
{
    EditTitlerController* files = EditTitlerController::getInstance();
    QSignalSpy spy(files, &EditTitlerController::renameUserTemplate);
    FileManagerDefine::tagRenameNotify notify;
    notify.fileType = 8;
    for (int i = 0; i < 4; ++i)
        notify.strings[i] = std::to_wstring(i + 1);
    files->renameTitlerTemplateNotify(notify);
    QCOMPARE(spy.size(), 1);
    QCOMPARE(spy.first(), QVariantList({"1", "3", "4"}));
    notify.fileType = 6;
    files->renameTitlerTemplateNotify(notify);
    QCOMPARE(spy.size(), 1);
}

void tst_titlertoolfactory_controllers::ownLockEventsHaveNoEffect()
{
    TitlerAPPEventFilterController* locks = TitlerAPPEventFilterController::getInstance();
    QSignalSpy spy(locks, &TitlerAPPEventFilterController::signalSendAPPEvent);
    locks->postAPPEventFilterNotify({1, 1, true, APPEventDefine::EVENTREVICER_TITLER});
    QCOMPARE(spy.size(), 0);
    locks->postAPPEventFilterNotify({1, 1, true, APPEventDefine::EVENTREVICER_NONE});
    QCOMPARE(spy.size(), 1);

    locks->sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, true);
    QTRY_COMPARE(m_siblings.methodsOf(APP_EVENT_FILTER), Methods{1});
    QByteArray data = m_siblings.lastArguments(APP_EVENT_FILTER, 1);
    APPEventDefine::_tagAPPEvent sent;
    APPEventFilterParams::deserialize_postAPPEventFilter_param(sent, data.data(), data.size());
    QCOMPARE(sent.clientId, 15);
    QCOMPARE(sent.lockType, 2);
    QVERIFY(sent.flag);
    QCOMPARE(sent.eventReceiver, 3);
}

void tst_titlertoolfactory_controllers::restoreOriginalIsTold()
{
    TitlerAPPEventFilterController* locks = TitlerAPPEventFilterController::getInstance();
    QSignalSpy spy(locks, &TitlerAPPEventFilterController::signalRestoreOriginal);
    locks->informRestoreOriginal(APPEventDefine::EVENTREVICER_NONE);
    QCOMPARE(spy.size(), 0);
    locks->informRestoreOriginal(APPEventDefine::EVENTREVICER_RESTORE_ALL);
    QCOMPARE(spy.size(), 1);
    QTRY_COMPARE(m_siblings.methodsOf(APP_EVENT_FILTER), Methods({2, 2}));
    locks->postRestoreOriginalNotify({1, 0, false, APPEventDefine::EVENTREVICER_TITLER});
    QCOMPARE(spy.size(), 1);
    locks->postRestoreOriginalNotify({1, 0, false, APPEventDefine::EVENTREVICER_NONE});
    QCOMPARE(spy.size(), 2);
    QSignalSpy focus(locks, &TitlerAPPEventFilterController::signalRestoreFocus);
    locks->postRestoreFocusNotify();
    QCOMPARE(focus.size(), 1);
}

void tst_titlertoolfactory_controllers::projectLoadAsksForLanguages_data()
{
    QTest::addColumn<int>("state");
    QTest::addColumn<bool>("asks");
    QTest::newRow("0") << 0 << false;
    QTest::newRow("1") << 1 << true;
    QTest::newRow("2") << 2 << true;
    QTest::newRow("3") << 3 << false;
}

void tst_titlertoolfactory_controllers::projectLoadAsksForLanguages()
{
    QFETCH(int, state);
    QFETCH(bool, asks);
    TitlerProjectDataController::getInstance()->loadNotify(state);
    SystemSetupInfoController::getInstance()->getModuleInfo();
    QTRY_COMPARE(m_siblings.methodsOf(SYSTEM_SETUP), asks ? Methods({1, 16}) : Methods{16});
}

void tst_titlertoolfactory_controllers::powerEventsAreSignals()
{
    TitlerPowerController* power = TitlerPowerController::getInstance();
    QSignalSpy off(power, &TitlerPowerController::signalPowerOff);
    QSignalSpy on(power, &TitlerPowerController::signalPowerOn);
    power->powerOff();
    power->powerOn();
    QCOMPARE(off.size(), 1);
    QCOMPARE(on.size(), 1);
}

void tst_titlertoolfactory_controllers::messageCarriesItsNumberAndText()
{
    ShowMessageController::getInstance()->postMessage(MessageDef::MESSAGE_FONT_MISSING, QString("書体"));
    QTRY_COMPARE(m_siblings.methodsOf(MESSAGE_CENTER), Methods{3});
    QByteArray data = m_siblings.lastArguments(MESSAGE_CENTER, 3);
    MessageDefine::_tagMessageParam sent;
    MessageCenterParams::deserialize_postMessage_param(sent, data.data(), data.size());
    QCOMPARE(sent.clientId, 12);
    QCOMPARE(sent.boxKind, 2);
    QCOMPARE(sent.boxType, -1);
    QVERIFY(sent.first.empty());
    QCOMPARE(sent.text, std::wstring(L"書体"));
    QCOMPARE(sent.messageId, 109);
}

void tst_titlertoolfactory_controllers::messagesWithoutServiceAreLost()
{
    if (m_factory) {
        // The hand-shake was seen to come after it.
        QVERIFY(m_siblings.methodsOf(MESSAGE_CENTER).isEmpty());
        return;
    }
    ShowMessageController::getInstance()->postMessage(MessageDef::MESSAGE_TEXT_OBJECT_LIMIT);
}

void tst_titlertoolfactory_controllers::onTopFollowsTheService()
{
    ShowMessageController* messages = ShowMessageController::getInstance();
    QSignalSpy closed(messages, &MessageBoxController::signalCloseMessage);
    messages->getTopWindowNotify(2);
    QVERIFY(!messages->GetTitlerIsTop());
    messages->getTopWindowNotify(1);
    QVERIFY(messages->GetTitlerIsTop());
    messages->closeMessageNotify({12, 2, 117});
    QCOMPARE(closed.size(), 1);
    messages->changeTopWindow(MessageDefine::TOP_WINDOW_MAIN);
    QTRY_COMPARE(m_siblings.methodsOf(MESSAGE_CENTER), Methods{1});
    QCOMPARE(m_siblings.lastArguments(MESSAGE_CENTER, 1), QByteArray("\x0c\x02"));
    QVERIFY(messages->getMapData().isEmpty());
}

// The power service of this test never gives one.
void tst_titlertoolfactory_controllers::requestsWaitForTheLastClientId()
{
    QSignalSpy spy(ShowTitlerController::getInstance(), &ShowTitlerController::signalShowTitlerParameter);
    ShowTitlerController::getInstance()->showTitler();
    QCOMPARE(spy.size(), 0);
    EarlyRequests::getInstance()->clientIdCame(POWER_MANAGER);
    QTRY_COMPARE(spy.size(), 1);
}

void tst_titlertoolfactory_controllers::showTitlerIsMode1()
{
    QSignalSpy spy(ShowTitlerController::getInstance(), &ShowTitlerController::signalShowTitlerParameter);
    ShowTitlerController::getInstance()->showTitler();
    QCOMPARE(spy.size(), 1);
    QCOMPARE(spy.first().first().value<titler_paramter>().mode, 1);
    ShowTitlerController::getInstance()->changeFolderStatus({4, L"/t/a"});
    QTRY_COMPARE(m_siblings.methodsOf(SHOW_TITLER), Methods{1});
}

QTEST_MAIN(tst_titlertoolfactory_controllers)
#include "tst_titlertoolfactory_controllers.moc"

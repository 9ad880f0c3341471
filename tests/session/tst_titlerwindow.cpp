// The main window against siblings that only listen: layout, requests, closing, masks, move mode, language.
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/ShowTitlerController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "app/TitlerWindow.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/CanvasController.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "document/TitleParser.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "messaging/services/ServiceFamilies.h"
#include "tests/app/Siblings.h"
#include "tests/library/LibraryFixture.h"
#include "tests/support/LogFixture.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QAction>
#include <QApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QLabel>
#include <QPointer>
#include <QSignalSpy>
#include <QTest>
#include <QWindow>

namespace
{

constexpr long MESSAGE_CENTER = 65;
constexpr long SET_TOP_WINDOW = 1;
constexpr long POST_MESSAGE = 3;

// Counts how often a window is shown, however shortly.
class ShowCounter : public QObject
{
public:
    explicit ShowCounter(QObject* window) { window->installEventFilter(this); }
    int count() const { return m_count; }

protected:
    bool eventFilter(QObject* /*watched*/, QEvent* event) override
    {
        m_count += event->type() == QEvent::Show ? 1 : 0;
        return false;
    }

private:
    int m_count = 0;
};

} // namespace

class tst_titlerwindow : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void cleanup();

    void hiddenAfterStart();
    void layoutOfTheCanvas();
    void folderRequestShowsItsTitles();
    void fileRequestShowsTheTitle();
    void secondRequestIsDropped();
    void missingPathIsNeverShown();
    void pathsOutsideAreNeverShown_data();
    void pathsOutsideAreNeverShown();
    void closeHidesAndEmpties();
    void closeWithNewFilesAsksFirst();
    void closeWhileFingersRestOnTitles();
    void otherMessagesDoNotClose();
    void createSessionAnswersInFolderOrder();
    void focusCommandLeavesACleanStackClean();
    void moveModeEatsPressesOutsideTheList();
    void masksOnlyWhileVisible();
    void masksGoWithTheWindow_data();
    void masksGoWithTheWindow();
    void theKeyboardLearnsTheWindowAtClose();
    void debugLinesGoToTheDebugLog();
    void missingFontIsReportedOnShow();
    void windowManagerCloseKeepsTheProcess();
    void languageFallsBackToEnglish();

private:
    QString writeTitle(const QString& folder, const QString& stem);
    QString writeFolder(const QString& name, const QStringList& stems);
    void request(const QString& path, int mode = _titler_paramter::CREATE_OR_EDIT);
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    CanvasScene* scene() const { return m_window->findChild<CanvasScene*>(); }

    LibraryFixture m_files;
    Siblings m_siblings;
    LogFixture m_log;
    TouchDevice m_device;
    TitlerWindow* m_window = nullptr;
};

void tst_titlerwindow::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_window = new TitlerWindow(true, nullptr);
    pMainWindow = m_window;
    m_window->setRealClose(false);
}

void tst_titlerwindow::cleanupTestCase()
{
    delete m_window;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow::cleanup()
{
    EditContextController::getInstance()->setITitlerNoCallBack();
    EditContextController::getInstance()->resultCallBack(nullptr);
    if (m_window->isVisible())
        m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
}

QString tst_titlerwindow::writeTitle(const QString& folder, const QString& stem)
{
    Archive archive;
    archive.setPath((folder + '/' + stem + ".xml").toStdString());
    archive.setThumbnailBig((stem + "_1920.png").toStdString());
    archive.setThumbnailMiddle((stem + "_960.png").toStdString());
    archive.setThumbnailSmall((stem + "_240.png").toStdString());
    archive.setThumbnailBlack((stem + "_240S.png").toStdString());
    auto* text = new TText;
    text->setTextObjectID(1);
    text->setText("Ab");
    text->setXValue(100);
    text->setYValue(100);
    text->setZValue(1);
    std::vector<TextStyle*> items;
    for (const char* character : {"A", "b"}) {
        items.push_back(new TextStyle);
        items.back()->setText(character);
    }
    text->setTextItems(items);
    archive.setText({text});
    TitleParser().writeOneTitle(&archive);
    return QString::fromStdString(archive.getPath());
}

QString tst_titlerwindow::writeFolder(const QString& name, const QStringList& stems)
{
    const QString folder = m_files.makeFolder(name);
    QList<ArchiveOrder*> rows;
    for (const QString& stem : stems) {
        writeTitle(folder, stem);
        rows << new ArchiveOrder;
        rows.last()->setArchiveIndex(static_cast<int>(rows.size()) - 1);
        rows.last()->setArchivePath((stem + ".xml").toStdString());
    }
    ArchiveController().saveArchiveListOrder(folder, rows);
    qDeleteAll(rows);
    return folder;
}

void tst_titlerwindow::request(const QString& path, int mode)
{
    m_window->showTitlerWindow({mode, path.toStdWString()});
}

void tst_titlerwindow::hiddenAfterStart()
{
    QVERIFY(!m_window->isVisible());
    QVERIFY(!m_window->windowIsVisible());
}

void tst_titlerwindow::layoutOfTheCanvas()
{
    request(writeFolder("layout", {"t1"}));
    auto* view = m_window->findChild<GraphicsView*>();
    QCOMPARE(QRect(view->mapTo(m_window, QPoint(0, 0)), view->size()), QRect(609, 97, 1280, 720));
    QCOMPARE(m_window->size(), QSize(1920, 1080));
    QCOMPARE(list()->size(), QSize(549, 997));
    QVERIFY(m_window->windowIsVisible());
}

void tst_titlerwindow::folderRequestShowsItsTitles()
{
    const QString folder = writeFolder("速報 folder", {"t1", "t2"});
    request(folder);
    QCOMPARE(list()->getCurrentPath(), folder);
    QCOMPARE(scene()->getTextItemList().size(), 1);
    QCOMPARE(QString::fromStdString(scene()->archive()->getPath()), folder + "/t1.xml");
}

void tst_titlerwindow::fileRequestShowsTheTitle()
{
    const QString folder = writeFolder("files", {"t1", "t2", "t3"});
    request(folder + "/t2.xml");
    QCOMPARE(QString::fromStdString(scene()->archive()->getPath()), folder + "/t2.xml");
}

void tst_titlerwindow::secondRequestIsDropped()
{
    const QString first = writeFolder("first", {"t1"});
    const QString second = writeFolder("second", {"t1"});
    request(first);
    request(second);
    QCOMPARE(list()->getCurrentPath(), first);
}

void tst_titlerwindow::missingPathIsNeverShown()
{
    const ShowCounter shows(m_window);
    request(m_files.titleRoot() + "/nowhere");
    QVERIFY(!m_window->isVisible());
    QCOMPARE(shows.count(), 0);
}

void tst_titlerwindow::pathsOutsideAreNeverShown_data()
{
    QTest::addColumn<QString>("path");
    QTest::newRow("folder") << "%1/elsewhere/foreign";
    QTest::newRow("title") << "%1/elsewhere/foreign/t2.xml";
    QTest::newRow("climbing folder") << "%2/news/../../../elsewhere/foreign";
    QTest::newRow("climbing title") << "%2/news/../../../elsewhere/foreign/t2.xml";
    QTest::newRow("linked folder") << "%2/link";
    QTest::newRow("title in a linked folder") << "%2/link/t2.xml";
    QTest::newRow("linked title") << "%2/news/link.xml";
    QTest::newRow("link to a title of ours") << "%1/elsewhere/ours.xml";
    QTest::newRow("root") << "%2";
    QTest::newRow("beside the root") << "%2 2/foreign";
}

void tst_titlerwindow::pathsOutsideAreNeverShown()
{
    QFETCH(QString, path);
    const QString data = QFileInfo(QFileInfo(m_files.titleRoot()).path()).path();
    writeFolder("news", {"t1"});
    for (const QString& folder : {data + "/elsewhere/foreign", m_files.titleRoot() + " 2/foreign"}) {
        QDir(folder).removeRecursively();
        QVERIFY(QDir().mkpath(folder));
        for (const char* stem : {"t1", "t2", "t3"})
            writeTitle(folder, stem);
        LibraryFixture::writeOrder(folder, {"t1"}); // the others would be cleaned up at Close
    }
    QFile::remove(m_files.titleRoot() + "/link");
    QVERIFY(QFile::link(data + "/elsewhere/foreign", m_files.titleRoot() + "/link"));
    QFile::remove(m_files.titleRoot() + "/news/link.xml");
    QVERIFY(QFile::link(data + "/elsewhere/foreign/t2.xml", m_files.titleRoot() + "/news/link.xml"));
    QFile::remove(data + "/elsewhere/ours.xml");
    QVERIFY(QFile::link(m_files.titleRoot() + "/news/t1.xml", data + "/elsewhere/ours.xml"));
    m_log.takeDebugLines();
    const ShowCounter shows(m_window);
    request(path.replace("%1", data).replace("%2", m_files.titleRoot()));
    QVERIFY(!m_window->isVisible());
    QCOMPARE(shows.count(), 0);
    QVERIFY(list()->getCurrentPath().isEmpty());
    QCOMPARE(m_log.takeDebugLines("ConfinedPath"),
             QStringList("400: Refused, a request asks for what lies outside: " + path));
    QCOMPARE(QDir(data + "/elsewhere/foreign").entryList({"*.xml"}, QDir::Files).size(), 3);
    QFile::remove(m_files.titleRoot() + "/link");
}

void tst_titlerwindow::closeHidesAndEmpties()
{
    request(writeFolder("closing", {"t1"}));
    QMetaObject::invokeMethod(m_window->findChild<ToolsBar*>(), "closeButtonClick");
    QVERIFY(!m_window->isVisible());
    QVERIFY(!m_window->windowIsVisible());
    QVERIFY(list()->getCurrentPath().isEmpty());
    QVERIFY(scene()->getTextItemList().isEmpty());
}

void tst_titlerwindow::closeWithNewFilesAsksFirst()
{
    struct Silent : ITitlerCallBack {
        void finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER) override
        {
            QFAIL("an edit session has no result");
        }
    };
    request(writeFolder("asking", {"t1"}));
    EditContextController::getInstance()->resultCallBack(new Silent);
    EditContextController::getInstance()->insertFilePath(L"new.xml");
    m_window->closeTitlerWindow();
    QVERIFY(m_window->isVisible());
    m_window->continueCloseTitler({1, MessageDefine::CLOSE_OK, MessageDef::MESSAGE_CONFIRM_CLOSE});
    QVERIFY(!m_window->isVisible());
}

// The touch that closes goes to all fingers, in no certain order.
void tst_titlerwindow::closeWhileFingersRestOnTitles()
{
    const QString folder = writeFolder("fingers", {"t1", "t2", "t3", "t4", "t5"});
    const auto* close = m_window->findChild<ToolsBar*>()->findChild<KSPushbutton*>(QStringLiteral("Close"));
    const QPoint onClose = close->mapTo(m_window, close->rect().center());
    for (int session = 0; session < 4; ++session) {
        request(folder);
        QVERIFY(QTest::qWaitForWindowExposed(m_window, PATIENCE_MS));
        QCOMPARE(list()->count(), 5);
        const QPointer<ArchiveItem> item = list()->archiveItem(0);
        QWindow* window = m_window->windowHandle();
        QTest::touchEvent(window, m_device).press(0, onClose, window);
        auto down = QTest::touchEvent(window, m_device, false);
        auto up = QTest::touchEvent(window, m_device, false);
        auto gone = QTest::touchEvent(window, m_device, false);
        down.stationary(0);
        up.release(0, onClose, window);
        for (int i = 0; i < 5; ++i) {
            const QPoint onTitle = list()->archiveItem(i)->mapTo(m_window, QPoint(60, 60));
            down.press(1 + i, onTitle, window);
            up.stationary(1 + i);
            gone.release(1 + i, onTitle, window);
        }
        down.commit();
        QVERIFY(m_window->isVisible());
        up.commit();
        QVERIFY(!m_window->isVisible());
        QTRY_VERIFY(!item);
        gone.commit();
    }
}

void tst_titlerwindow::otherMessagesDoNotClose()
{
    request(writeFolder("others", {"t1"}));
    m_window->continueCloseTitler({1, MessageDefine::CLOSE_OK, MessageDef::MESSAGE_FONT_MISSING});
    QVERIFY(m_window->isVisible());
}

void tst_titlerwindow::createSessionAnswersInFolderOrder()
{
    struct Result {
        int calls = 0;
        int count = 0;
        std::wstring path;
    };
    struct CallBack : ITitlerCallBack {
        explicit CallBack(Result& r) : result(r) {}
        void finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param) override
        {
            ++result.calls;
            result.count = param.count;
            result.path = param.path;
        }
        Result& result;
    };
    Result result;
    const QString folder = writeFolder("creating", {"t1"});
    EditContextController* context = EditContextController::getInstance();
    context->resultCallBack(new CallBack(result));
    QSignalSpy templates(list(), &ArchiveList::startTemplatePicker);
    request(folder);
    context->showTitlerCreate(5); // the window is open: only the context takes note
    Archive blank;
    list()->createArchiveFromTemplate(&blank);
    QTest::qWait(2); // names are made of the time in milliseconds
    list()->createArchiveFromTemplate(&blank);
    m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
    QCOMPARE(result.calls, 1);
    QCOMPARE(result.count, 2);
    QCOMPARE(QString::fromStdWString(result.path), folder);
    QVERIFY(!context->isCreateNew());
}

void tst_titlerwindow::focusCommandLeavesACleanStackClean()
{
    struct Focus : QUndoCommand {
        int id() const override { return 1; }
    };
    QAction* undo = nullptr;
    for (QAction* action : m_window->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly))
        if (action->text().startsWith("Undo"))
            undo = action;
    QVERIFY(undo);
    m_window->pushUndoStack(new Focus);
    QVERIFY(!undo->isEnabled());
    m_window->pushUndoStack(new QUndoCommand);
    QVERIFY(undo->isEnabled());
    m_window->clearUndoStack();
    QVERIFY(!undo->isEnabled());
}

void tst_titlerwindow::moveModeEatsPressesOutsideTheList()
{
    request(writeFolder("moving", {"t1"}));
    QVERIFY(QTest::qWaitForWindowExposed(m_window, PATIENCE_MS));
    KSPushbutton* move = nullptr;
    for (KSPushbutton* button : m_window->findChildren<KSPushbutton*>())
        if (button->text() == "Move")
            move = button;
    QVERIFY(move);
    QTest::mouseClick(move, Qt::LeftButton);
    QVERIFY(m_window->archiveListIsMoveMode());
    QCOMPARE(move->text(), QString("Done"));
    QTest::mouseClick(list(), Qt::LeftButton, {}, QPoint(20, 900));
    QVERIFY(m_window->archiveListIsMoveMode());
    QTest::mouseClick(m_window, Qt::LeftButton, {}, QPoint(1000, 950));
    QVERIFY(!m_window->archiveListIsMoveMode());
    QCOMPARE(move->text(), QString("Move"));

    QTest::mouseClick(move, Qt::LeftButton);
    QTest::mouseClick(move, Qt::LeftButton);
    QVERIFY(!m_window->archiveListIsMoveMode());
    QTest::mouseClick(move, Qt::LeftButton);
    Q_EMIT TitlerAPPEventFilterController::getInstance()->signalRestoreOriginal();
    QVERIFY(!m_window->archiveListIsMoveMode());
}

void tst_titlerwindow::masksGoWithTheWindow_data()
{
    QTest::addColumn<bool>("isMessage");
    QTest::addColumn<bool>("isOffWhileHidden");
    QTest::newRow("dialog mask") << false << false;
    QTest::newRow("message mask") << true << false;
    QTest::newRow("dialog mask, taken away while hidden") << false << true;
    QTest::newRow("message mask, taken away while hidden") << true << true;
}

void tst_titlerwindow::masksGoWithTheWindow()
{
    QFETCH(bool, isMessage);
    QFETCH(bool, isOffWhileHidden);
    const QString folder = writeFolder("masked", {"t1"});
    ShowMessageController* messages = ShowMessageController::getInstance();
    const auto isDark = [this] {
        for (const QWidget* child : m_window->findChildren<QWidget*>(QString(), Qt::FindDirectChildrenOnly))
            if (child->geometry() == m_window->rect() && child->autoFillBackground() && !child->isHidden() &&
                child->palette().color(QPalette::Window).alpha() == 166)
                return true;
        return false;
    };
    request(folder);
    QVERIFY(!isDark());
    isMessage ? messages->showMessageOpacityWidget() : messages->showDialogOpacityWidget();
    QVERIFY(isDark());
    m_window->closeTitlerWindow(); // as the answer to a message does while its box is still up
    QVERIFY(!m_window->isVisible());
    if (isOffWhileHidden)
        isMessage ? messages->hideMessageOpacityWidget() : messages->hideDialogOpacityWidget();
    QVERIFY(!isDark());
    request(folder);
    QVERIFY(!isDark());
    QVERIFY(m_window->testAttribute(Qt::WA_AcceptTouchEvents));
    QMetaObject::invokeMethod(m_window->findChild<ToolsBar*>(), "closeButtonClick");
    QVERIFY(!m_window->isVisible());
}

void tst_titlerwindow::theKeyboardLearnsTheWindowAtClose()
{
    request(writeFolder("window id", {"t1"}));
    const QString line = QStringLiteral("200: App Name:%1***WID:%2")
                             .arg(QCoreApplication::instance()->objectName())
                             .arg(m_window->winId());
    m_log.takeDebugLines();
    m_window->closeTitlerWindow();
    QCOMPARE(m_log.takeDebugLines("KSInputContext").count(line), 1);
}

void tst_titlerwindow::debugLinesGoToTheDebugLog()
{
    static QStringList printed;
    printed.clear();
    const QtMessageHandler before =
        qInstallMessageHandler([](QtMsgType type, const QMessageLogContext&, const QString& text) {
            if (type == QtDebugMsg)
                printed.append(text);
        });
    m_log.takeDebugLines();
    const QString folder = writeFolder("debug lines", {"t1"});
    Archive archive;
    archive.setPath((folder + "/saved.xml").toStdString());
    ArchiveController().saveNewArchive(folder, &archive);
    CanvasController().saveArchiveChange(folder + "/saved.xml", &archive);
    ArchiveController().deleteUnusefulArchives(folder);
    SubCommonDefine::tagFOLDER_TYPE status;
    status.path = folder.toStdWString();
    ShowTitlerController::getInstance()->changeFolderStatus(status);
    qInstallMessageHandler(before);
    QCOMPARE(printed, QStringList());
    const QStringList lines = m_log.takeDebugLines();
    for (const QString& line :
         {QStringLiteral("[ArchiveController] 200: Save new Archive Success !"),
          QStringLiteral("[CanvasController] 200: Save Archive Success !"),
          QStringLiteral("[ArchiveController] 200: Delete XML success"),
          "[ShowTitlerController] 200: ShowTitlerController_changeFolderStatus() [setFolderStatus()] Path:" +
              folder})
        QVERIFY2(lines.contains(line), qPrintable(line + " is not in " + lines.join('\n')));
}

void tst_titlerwindow::masksOnlyWhileVisible()
{
    ShowMessageController* messages = ShowMessageController::getInstance();
    QSignalSpy spy(messages, &ShowMessageController::signalsShowDialogMaskWidget);
    messages->showDialogOpacityWidget();
    QCOMPARE(spy.size(), 0);

    request(writeFolder("masks", {"t1"}));
    messages->showDialogOpacityWidget();
    QCOMPARE(spy.size(), 1);
    QVERIFY(!m_window->testAttribute(Qt::WA_AcceptTouchEvents));
    messages->showMessageOpacityWidget();
    messages->hideMessageOpacityWidget();
    QVERIFY(!m_window->testAttribute(Qt::WA_AcceptTouchEvents));
    messages->hideDialogOpacityWidget();
    QVERIFY(m_window->testAttribute(Qt::WA_AcceptTouchEvents));
}

void tst_titlerwindow::missingFontIsReportedOnShow()
{
    const auto messages = [this] {
        QList<int> ids;
        for (QByteArray arguments : m_siblings.argumentsOf(MESSAGE_CENTER, POST_MESSAGE)) {
            MessageDefine::_tagMessageParam message;
            MessageCenterParams::deserialize_postMessage_param(message, arguments.data(),
                                                               long(arguments.size()));
            ids.append(message.messageId);
        }
        return ids;
    };
    m_siblings.forget();
    m_window->setHasMessageToShowInformation(true, "No Such Family");
    request(writeFolder("fonts", {"t1"}));
    QTRY_COMPARE(messages(), QList<int>{MessageDef::MESSAGE_FONT_MISSING});
    // The message left once; a second show has nothing to tell.
    m_window->closeTitlerWindow();
    request(writeFolder("fonts", {"t1"}));
    QVERIFY(m_window->isVisible());
    m_window->closeTitlerWindow();
    QTRY_COMPARE(m_siblings.countOf(MESSAGE_CENTER, SET_TOP_WINDOW), 4);
    QCOMPARE(messages(), QList<int>{MessageDef::MESSAGE_FONT_MISSING});
}

void tst_titlerwindow::windowManagerCloseKeepsTheProcess()
{
    QSignalSpy quit(qApp, &QCoreApplication::aboutToQuit);
    request(writeFolder("wm", {"t1"}));
    m_window->close();
    QVERIFY(!m_window->isVisible());
    QCOMPARE(quit.size(), 0);
    request(m_files.titleRoot() + "/wm");
    QVERIFY(m_window->isVisible());
}

void tst_titlerwindow::languageFallsBackToEnglish()
{
    m_window->slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageChinese);
    QVERIFY(m_window->styleSheet().contains("DFHeiW5-A"));
    m_window->slotSystemLanguageChanged(static_cast<SystemSetupDef::emSystemLanguageType>(42));
    QVERIFY(m_window->styleSheet().contains("'KST'"));
    QCOMPARE(m_window->windowTitle(), QString("Titler"));
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    QApplication::setQuitOnLastWindowClosed(false);
    tst_titlerwindow test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow.moc"

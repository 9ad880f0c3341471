// The end of a session whose work the disk refuses, or takes only slowly: what the operator is asked, what he
// sees and who waits for what.
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/SavingNotice.h"
#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "messaging/services/ServiceFamilies.h"
#include "support/FileSyncQueue.h"
#include "support/RefusedWrites.h"
#include "tests/app/Siblings.h"
#include "tests/fakes/FakeTitlerCallBack.h"
#include "tests/library/LibraryFixture.h"
#include "tests/support/FullDisk.h"
#include "tests/support/LogFixture.h"
#include "tests/support/Patience.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QTest>
#include <QTextCursor>
#include <atomic>
#include <condition_variable>
#include <mutex>
#include <sys/syscall.h>
#include <unistd.h>

namespace
{

std::mutex gMutex;
std::condition_variable gGoesOn;
bool gHangs = false;
std::atomic<int> gSyncsOfTheWindow = 0;

// A disk on which no sync comes back. The window's thread must not ask for one.
class HangingDisk
{
public:
    HangingDisk()
    {
        const std::lock_guard lock(gMutex);
        gHangs = true;
    }
    ~HangingDisk()
    {
        const std::lock_guard lock(gMutex);
        gHangs = false;
        gGoesOn.notify_all();
    }
    HangingDisk(const HangingDisk&) = delete;
    HangingDisk& operator=(const HangingDisk&) = delete;
};

int sync(long call, int descriptor)
{
    if (::syscall(SYS_gettid) == ::getpid()) {
        ++gSyncsOfTheWindow;
    } else {
        std::unique_lock lock(gMutex);
        gGoesOn.wait(lock, [] { return !gHangs; });
    }
    return static_cast<int>(::syscall(call, descriptor));
}

} // namespace

// In place of the system's, for all threads of this process.
extern "C" int fsync(int descriptor)
{
    return sync(SYS_fsync, descriptor);
}
extern "C" int fdatasync(int descriptor)
{
    return sync(SYS_fdatasync, descriptor);
}

// Counts how often a widget was painted.
class PaintCounter : public QObject
{
public:
    explicit PaintCounter(QObject* widget) { widget->installEventFilter(this); }
    bool eventFilter(QObject*, QEvent* event) override
    {
        paints += event->type() == QEvent::Paint ? 1 : 0;
        return false;
    }
    int paints = 0;
};

class tst_titlerwindow_fulldisk : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void closeAsksBeforeWorkIsLost();
    void cancelKeepsTheSession();
    void workThatFitsByNowIsNotAskedAbout();
    void orderAndPicturesAreNamed();
    void endOfTheProcessAsksNobody();
    void slowDiskKeepsNobodyWaiting();
    void savingIsShown();

private:
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    CanvasScene* scene() const { return m_window->findChild<CanvasScene*>(); }
    void type(const QString& text)
    {
        GraphicsText* item = scene()->findTextItem(1);
        QVERIFY(item);
        item->setTextInteractionFlags(Qt::TextEditorInteraction);
        QTextCursor cursor = item->textCursor();
        cursor.movePosition(QTextCursor::End);
        cursor.insertText(text);
    }
    void choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row)
    {
        list()->itemRightPressedEvent(list()->archiveItem(row), QPoint(20, 20), list());
        list()->selectOptionMenuItem(list()->findChild<ArchiveMenu*>()->action(type));
        list()->slotHideOptionMenu();
    }
    void answer(MessageDefine::_emCloseType type)
    {
        m_window->continueCloseTitler({1, type, MessageDef::MESSAGE_CONFIRM_CLOSE});
    }
    // Texts of the boxes with this number that were asked for.
    QStringList boxes(int number) const
    {
        QStringList texts;
        for (QByteArray call : m_siblings.argumentsOf(MessageCenterRemoteProxy::INTERFACE_ID,
                                                      MessageCenterRemoteProxy::METHOD_postMessage)) {
            MessageDefine::_tagMessageParam message;
            MessageCenterParams::deserialize_postMessage_param(message, call.data(), long(call.size()));
            if (message.messageId == number)
                texts.append(QString::fromStdWString(message.text));
        }
        return texts;
    }
    QString onDisk(const QString& name) const
    {
        QFile file(m_folder + '/' + name);
        return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
    }
    // What a process sees that has nothing in memory.
    QString textOnDisk(const QString& stem) const
    {
        const QString link = m_fixture.titleRoot() + "/link.xml"; // nothing is kept for this name
        QFile::remove(link);
        Archive title;
        if (!QFile::link(m_folder + '/' + stem + ".xml", link) ||
            !ArchiveController().getOneArchive(link, &title) || title.text().empty())
            return {};
        return QString::fromStdString(title.text().front()->getText());
    }

    LibraryFixture m_fixture;
    LogFixture m_log;
    Siblings m_siblings;
    std::unique_ptr<TitlerWindow> m_window;
    QString m_folder;
};

void tst_titlerwindow_fulldisk::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
}

void tst_titlerwindow_fulldisk::init()
{
    APPEventFilter::instance();
    m_window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = m_window.get();
    m_window->setRealClose(false);
    m_folder = m_fixture.makeFolder(QStringLiteral("News"));
    LibraryFixture::fillFolder(m_folder, {"a", "b", "c"});
    m_siblings.forget();
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, m_folder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    QTRY_VERIFY(list()->archiveItem(2) && list()->archiveItem(2)->hasChildWidgets());
    QTRY_VERIFY(scene()->isEditFinish());
}

void tst_titlerwindow_fulldisk::cleanup()
{
    RefusedWrites::forgetFolder(m_fixture.titleRoot().toStdString());
    if (m_window && m_window->isVisible())
        m_window->endProcess();
    m_window.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_fulldisk::closeAsksBeforeWorkIsLost()
{
    {
        const FullDisk disk;
        type(QStringLiteral(" 快讯"));
        m_window->closeTitlerWindow();
        QVERIFY(m_window->isVisible());
        QTRY_COMPARE(boxes(117).size(), 1);
        QVERIFY2(boxes(117).front().contains(QString::fromUtf8("\"a 快讯\"")),
                 qPrintable(boxes(117).front()));
        QTRY_COMPARE(boxes(114), QStringList{"File"}); // one message, whatever number of writes was refused
        m_window->continueCloseTitler({1, MessageDefine::CLOSE_OK, 114}); // another box
        QVERIFY(m_window->isVisible());
        answer(MessageDefine::CLOSE_OK);
    }
    QVERIFY(!m_window->isVisible());
    QVERIFY(RefusedWrites::isEmpty());
    QCOMPARE(textOnDisk("a"), QStringLiteral("a"));
}

void tst_titlerwindow_fulldisk::cancelKeepsTheSession()
{
    {
        const FullDisk disk;
        type(QStringLiteral("!"));
        m_window->closeTitlerWindow();
        QTRY_COMPARE(boxes(117).size(), 1);
        answer(MessageDefine::CLOSE_CANCEL);
        QVERIFY(m_window->isVisible());
        type(QStringLiteral("?"));
        m_window->closeTitlerWindow();
        QTRY_COMPARE(boxes(117).size(), 2);
        answer(MessageDefine::CLOSE_CANCEL);
        QVERIFY(m_window->isVisible());
        QCOMPARE(textOnDisk("a"), QStringLiteral("a"));
    }
    // Nobody does anything.
    QTRY_COMPARE(textOnDisk("a"), QStringLiteral("a!?"));
    QTRY_VERIFY(RefusedWrites::isEmpty());
    QCOMPARE(boxes(114).size(), 1);
    m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
    QCOMPARE(boxes(117).size(), 2);
}

void tst_titlerwindow_fulldisk::workThatFitsByNowIsNotAskedAbout()
{
    {
        const FullDisk disk;
        type(QStringLiteral("!"));
        m_window->hideSoftWareWithDeleteEmptyItems();
        choose(ArchiveAction::ACTION_DELETE, 2);
        QVERIFY(!RefusedWrites::isEmpty());
    }
    m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
    QCOMPARE(textOnDisk("a"), QStringLiteral("a!"));
    QVERIFY(!onDisk(".order.xml").contains("c.xml"));
    for (const char* picture : {"/a_1920.png", "/a_960.png", "/a_240.png", "/a_240S.png"})
        QVERIFY2(!QImage(m_folder + picture).isNull(), picture);
    QCOMPARE(QImage(m_folder + "/a_1920.png").size(), QSize(1920, 1080));
    QVERIFY(RefusedWrites::isEmpty());
}

void tst_titlerwindow_fulldisk::orderAndPicturesAreNamed()
{
    type(QStringLiteral("!"));
    m_window->hideSoftWareWithDeleteEmptyItems();
    const FullDisk disk;
    choose(ArchiveAction::ACTION_DELETE, 2);
    m_window->closeTitlerWindow();
    QVERIFY(m_window->isVisible());
    QTRY_COMPARE(boxes(117).size(), 1);
    const QString text = boxes(117).front();
    QVERIFY2(text.contains("the order of the titles in \"News\""), qPrintable(text));
    QVERIFY2(text.contains("the pictures of \"a!\""), qPrintable(text));
    QVERIFY2(!text.contains("the title \""), qPrintable(text));
    answer(MessageDefine::CLOSE_OK);
    QVERIFY(!m_window->isVisible());
    QCOMPARE(QImage(m_folder + "/a_1920.png").size(), QSize(240, 135)); // the one before is still on air
}

void tst_titlerwindow_fulldisk::endOfTheProcessAsksNobody()
{
    const FullDisk disk;
    type(QStringLiteral("!"));
    m_window->endProcess();
    QVERIFY(!m_window->isVisible());
    QVERIFY(RefusedWrites::isEmpty());
    QCOMPARE(textOnDisk("a"), QStringLiteral("a"));
}

void tst_titlerwindow_fulldisk::slowDiskKeepsNobodyWaiting()
{
    QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
    Answers answers;
    EditContextController* context = EditContextController::getInstance();
    context->resultCallBack(new FakeTitlerCallBack(answers));
    context->showTitlerCreate(3);
    choose(ArchiveAction::ACTION_COPY, 0);
    choose(ArchiveAction::ACTION_PASTE, 0);
    m_log.takeDebugLines();
    gSyncsOfTheWindow = 0;
    {
        const HangingDisk disk;
        type(QStringLiteral("!"));
        m_window->closeTitlerWindow(); // comes back although the disk does not
        QVERIFY(!m_window->isVisible());
        QCOMPARE(gSyncsOfTheWindow.load(), 0);
        QCOMPARE(answers.calls, 1);
        QCOMPARE(answers.paths.size(), 1);
        const QString stem = answers.paths.front().chopped(4);
        QCOMPARE(textOnDisk(stem), QStringLiteral("a!"));
        QCOMPARE(QImage(m_folder + '/' + stem + "_1920.png").size(), QSize(1920, 1080));
        // The log says what the disk owes.
        QString lines;
        const auto isLogged = [&] {
            lines += m_log.takeDebugLines("TitlerWindow").join('\n');
            return lines.contains("not yet on the disk: " + m_folder);
        };
        QTRY_VERIFY2(isLogged(), qPrintable(lines));
    }
    QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
}

void tst_titlerwindow_fulldisk::savingIsShown()
{
    auto* notice = m_window->findChild<SavingNotice*>();
    QVERIFY(notice);
    PaintCounter counter(notice);
    type(QStringLiteral("!"));
    m_window->closeTitlerWindow();
    QVERIFY(counter.paints > 0);
    QCOMPARE(notice->geometry(), m_window->rect());
    QVERIFY(!notice->isVisible());
    QVERIFY(!m_window->isVisible());
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    QApplication::setQuitOnLastWindowClosed(false);
    tst_titlerwindow_fulldisk test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow_fulldisk.moc"

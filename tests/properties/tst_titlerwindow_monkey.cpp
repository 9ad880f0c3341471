// Many touches anywhere in the whole program: the tools bar, the list and its menu, the canvas, the panel,
// the palette, both pickers and their keyboard, sessions that begin and end, and what other processes do
// meanwhile. TITLER_SEED repeats a run, TITLER_TOUCHES changes its length: a hundred thousand take some
// minutes.
#include "LibraryModel.h"
#include "MonkeyGround.h"
#include "OtherProcesses.h"
#include "SoftKeyboardStandIn.h"
#include "TitleAccount.h"
#include "WindowFingers.h"
#include "messaging/services/ITitler.h"
#include "tests/app/Siblings.h"
#include "tests/canvas/CanvasTestTools.h"
#include "tests/fakes/FakeTitlerCallBack.h"
#include "tests/support/Patience.h"
#include "tests/support/RandomSeed.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/CustomTreeDelegete.h"

#include <QElapsedTimer>
#include <QEventLoop>
#include <QLoggingCategory>
#include <QSocketNotifier>
#include <sys/eventfd.h>
#include <unistd.h>

// The program waits for its pictures by the second; here it looks again at once.
extern "C" unsigned int sleep(unsigned int)
{
    ::usleep(2000);
    return 0;
}

namespace
{

#ifdef __SANITIZE_ADDRESS__
constexpr int DEFAULT_TOUCHES = 1000;
#else
constexpr int DEFAULT_TOUCHES = 5000;
#endif
constexpr int TOUCHES_FOR_ALL = 5000; // from which on everything must happen
constexpr int MOST_ROUNDS = 4;        // as often as that many touches
constexpr int DEFAULT_SEED = 20261;
constexpr int TOUCHES_PER_FRAME = 16;
constexpr int TOUCHES_PER_GLANCE = 40; // at what is shown
constexpr int TOUCHES_PER_LOOK = 1000; // at what is on disk
constexpr int LOOKS_PER_PICTURE = 5;   // read the pictures, too

const char* const MUST_HAPPEN[] = {"titles made",
                                   "titles pasted",
                                   "titles deleted",
                                   "titles moved",
                                   "titles focused",
                                   "templates saved",
                                   "templates deleted by the operator",
                                   "templates imported",
                                   "templates renamed by the file manager",
                                   "templates deleted by the file manager",
                                   "folders made",
                                   "folders renamed",
                                   "folders duplicated",
                                   "folders opened",
                                   "folders renamed by the file manager",
                                   "folders deleted by the file manager",
                                   "undo",
                                   "redo",
                                   "closes",
                                   "answers to the asker",
                                   "requests to create",
                                   "requests to edit a folder",
                                   "requests to edit a title",
                                   "requests without a path",
                                   "requests for what is not there",
                                   "requests of the sub panel",
                                   "lines typed on the keyboard",
                                   "texts typed on the keyboard",
                                   "keyboards put away",
                                   "languages changed",
                                   "masks shown",
                                   "presses in other processes",
                                   "boxes answered OK",
                                   "boxes answered Cancel",
                                   "message 43",
                                   "message 47",
                                   "message 112",
                                   "message 117",
                                   "FolderPicker shown",
                                   "TemplatePicker shown",
                                   "ArchiveMenu shown",
                                   "ColorPalette shown"};

} // namespace

class tst_titlerwindow_monkey : public QObject
{
    Q_OBJECT

public:
    bool eventFilter(QObject* object, QEvent* event) override;

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void manyTouches();

private:
    void makeFolders();
    void countWhatHappens();
    void countFolderEdits();
    void turn();
    bool isEnough() const;
    QStringList missed() const;
    void play();
    void stop();
    QString glance() const;
    QString glanceAtList() const;
    QString lookAtDisk(bool withPictures);
    void fail(const QString& what);
    void report(qint64 milliseconds) const;
    CanvasScene* scene() const { return mWindow->findChild<CanvasScene*>(); }
    ArchiveList* list() const { return mWindow->findChild<ArchiveList*>(); }
    FolderPicker* folders() const { return mWindow->findChild<FolderPicker*>(); }
    TemplatePicker* templates() const { return mWindow->findChild<TemplatePicker*>(); }
    template <class... Arguments>
    auto counting(const char* what)
    {
        return [this, what](Arguments...) { ++mCounts[QLatin1String(what)]; };
    }

    MonkeyGround::DataInMemory mInMemory;
    TemplateFixture mFiles;
    TitleAccount mAccount{mFiles};
    Siblings mSiblings;
    SoftKeyboardStandIn mKeyboard;
    Counts mCounts;
    std::unique_ptr<OtherProcesses> mOthers;
    std::unique_ptr<WindowFingers> mFingers;
    TitlerWindow* mWindow = nullptr;
    TouchDevice mDevice;
    QEventLoop* mLoop = nullptr;
    QString mFailure;
    QStringList mDoings;
    quint32 mSeed = 0;
    int mTouches = 0;
    int mNextGlance = 0;
    int mNextLook = 0;
    int mLooks = 0;
};

void tst_titlerwindow_monkey::initTestCase()
{
    mSeed = RandomSeed(DEFAULT_SEED);
    mTouches = runLength("TITLER_TOUCHES", DEFAULT_TOUCHES);
    qInfo("seed %u, %d touches", mSeed, mTouches);
    MonkeyGround::showErrorsOnly();
    QLoggingCategory::setFilterRules(QStringLiteral("*.debug=false"));
    QVERIFY(mSiblings.listenOnFreePorts());
    mFiles.resetTemplates();
    mFiles.makePresets("templates_en", {"lower", "strap", QString::fromUtf8("速報")}, true);
    mFiles.makePresets("templates_chs", {"xia", QString::fromUtf8("快讯")}, true);
    mFiles.makeUserTemplates(5);
    makeFolders();
    mWindow = makeWaitingWindow();
    KSInputContext::instance()->setKeyBoardController(&mKeyboard);
    EditContextController::getInstance()->resultCallBack(
        new FakeTitlerCallBack([this](const _CALLBACK_TITLER_PARAMTER& param) {
            ++mCounts[QStringLiteral("answers to the asker")];
            mCounts[QStringLiteral("titles in answers")] += param.count;
        }));
    mOthers = std::make_unique<OtherProcesses>(mSiblings, mFiles, mAccount, mCounts, mSeed + 1);
    mFingers = std::make_unique<WindowFingers>(*mWindow, mDevice, mSeed, mKeyboard, *mOthers,
                                               mFiles.titleRoot(), mCounts);
    countWhatHappens();
    countFolderEdits();
}

void tst_titlerwindow_monkey::cleanupTestCase()
{
    MonkeyGround::Application::instance()->frozen = false;
    KSInputContext::instance()->setKeyBoardController(nullptr);
    delete mWindow;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

// A few titles in several scripts, an empty folder, and one that is full.
void tst_titlerwindow_monkey::makeFolders()
{
    const QStringList names{QStringLiteral("news"),          QString::fromUtf8("快讯"),
                            QString::fromUtf8("速報 sport"), QString::fromUtf8("Погода"),
                            QStringLiteral("empty"),         QStringLiteral("long")};
    QStringList stems{QStringLiteral("first"), QString::fromUtf8("人名"), QString::fromUtf8("속보"),
                      QString::fromUtf8("ひと"), QStringLiteral("last")};
    for (const QString& name : names) {
        const QString folder = mFiles.makeFolder(name);
        if (name == names.last())
            for (int i = int(stems.size()); i < 99; ++i)
                stems.append(QStringLiteral("%1").arg(i, 3, 10, QLatin1Char('0')));
        if (name != QLatin1String("empty"))
            LibraryFixture::fillFolder(folder, stems);
    }
}

void tst_titlerwindow_monkey::countWhatHappens()
{
    connect(templates(), &TemplatePicker::selectedTemplate, this, counting<Archive*>("titles made"));
    connect(list(), &ArchiveList::signalStartPasteArchive, this, counting<>("titles pasted"));
    connect(list(), &ArchiveList::moveCommandSignal, this, counting<QUndoCommand*>("titles moved"));
    connect(list(), &ArchiveList::focusCommandSignal, this, counting<QUndoCommand*>("titles focused"));
    connect(list(), &ArchiveList::addUserSignal, this, counting<QString>("templates saved"));
    connect(folders(), &FolderPicker::changeFolderPath, this, counting<QString>("folders opened"));
    const auto* bar = mWindow->findChild<ToolsBar*>();
    connect(bar, &ToolsBar::closeButtonClick, this, counting<>("closes"));
    connect(list(), &ArchiveList::deleteCommandSignal, this, counting<QUndoCommand*>("titles deleted"));
    for (const QAction* action : mFingers->undoAndRedo()) {
        const char* what = action->text().startsWith(QLatin1String("Undo")) ? "undo" : "redo";
        connect(action, &QAction::triggered, this, counting<bool>(what));
    }
    // A title that was deleted is to go, and one that was made can be taken back.
    const auto mayGo = [this](const ArchiveItem* item) {
        const QFileInfo file(item ? item->getArchiveDataPath() : QString());
        mAccount.titleMayGo(file.path(), file.completeBaseName());
    };
    connect(list(), &ArchiveList::deleteCommandSignal, this,
            [this, mayGo] { mayGo(list()->getCurrentOperationArchive()); });
    connect(list(), &ArchiveList::pasteCommandSignal, this,
            [this, mayGo] { mayGo(list()->getSelectedArchive()); });
    qApp->installEventFilter(this);
}

// At the moment of the commit: what it was about is forgotten afterwards.
void tst_titlerwindow_monkey::countFolderEdits()
{
    const FolderPicker* picker = folders();
    connect(picker->treeView()->treeDelegate(), &CustomTreeDelegete::signalLineEditCommitted, this,
            [this, picker](const QString& name) {
                if (!QFileInfo(mFiles.titleRoot() + '/' + name).isDir())
                    return;
                if (picker->editAction() == FolderPicker::FOLDER_EDIT_CREATE)
                    ++mCounts["folders made"];
                else if (picker->editAction() == FolderPicker::FOLDER_EDIT_RENAME)
                    ++mCounts["folders renamed"];
                else if (picker->editAction() == FolderPicker::FOLDER_EDIT_DUPLICATE)
                    ++mCounts["folders duplicated"];
            });
}

bool tst_titlerwindow_monkey::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::Show && object->isWidgetType() && static_cast<QWidget*>(object)->isWindow())
        ++mCounts[QLatin1String(object->metaObject()->className()) + QStringLiteral(" shown")];
    return false;
}

// The fingers play at every turn of the event loop, and so in the loop of each dialog that they open.
void tst_titlerwindow_monkey::turn()
{
    if (mFailure.isEmpty() && !isEnough())
        play();
    else
        stop();
}

// Where everything is to happen, what is rare is waited for.
bool tst_titlerwindow_monkey::isEnough() const
{
    const int touches = mFingers->touches();
    return touches >= mTouches &&
           (mTouches < TOUCHES_FOR_ALL || touches >= mTouches * MOST_ROUNDS || missed().isEmpty());
}

QStringList tst_titlerwindow_monkey::missed() const
{
    QStringList missed;
    for (const char* what : MUST_HAPPEN)
        if (mCounts.value(QLatin1String(what)) == 0)
            missed.append(QLatin1String(what));
    return missed;
}

void tst_titlerwindow_monkey::play()
{
    for (int i = 0; i < TOUCHES_PER_FRAME && mFailure.isEmpty(); ++i) {
        const QWidget* dialog = QApplication::activeModalWidget();
        const bool isHidden = mWindow->isHidden();
        mFingers->step();
        if (!mFailure.isEmpty())
            return;
        if (!mFingers->isTouching()) {
            if (const QString held = MonkeyGround::heldLocks(); !held.isEmpty())
                return fail(held);
        }
        if (mFingers->touches() >= mNextGlance) {
            mNextGlance = mFingers->touches() + TOUCHES_PER_GLANCE;
            if (const QString wrong = glance(); !wrong.isEmpty())
                return fail(wrong);
        }
        if (mFingers->touches() >= mNextLook) {
            mNextLook = mFingers->touches() + TOUCHES_PER_LOOK;
            if (const QString wrong = lookAtDisk(++mLooks % LOOKS_PER_PICTURE == 0); !wrong.isEmpty())
                return fail(wrong);
        }
        // A dialog that has closed must get its turn to end.
        if (dialog != QApplication::activeModalWidget() || isHidden != mWindow->isHidden())
            return;
    }
}

// One dialog after the other ends, and then the loop that all began in.
void tst_titlerwindow_monkey::stop()
{
    mFingers->end();
    if (QApplication::activeModalWidget() == templates() && templates()->isVisible())
        templates()->reject();
    else if (folders()->isVisible())
        folders()->done(QDialog::Rejected);
    else
        mLoop->quit();
}

void tst_titlerwindow_monkey::fail(const QString& what)
{
    mFailure = QString("seed %1, touch %2: %3\nthe last touches:\n%4")
                   .arg(mSeed)
                   .arg(mFingers->touches())
                   .arg(what, mFingers->lastTouches().join('\n'));
}

// What holds at any moment.
QString tst_titlerwindow_monkey::glance() const
{
    const QList<GraphicsText*> texts = scene()->getTextItemList();
    if (texts.size() > CanvasScene::MAX_TEXT_OBJECTS)
        return QString("%1 texts").arg(texts.size());
    for (const GraphicsText* text : texts)
        if (!inStep(*text))
            return "out of step: " + text->toPlainText();
    if (mWindow->isHidden() && (folders()->isVisible() || templates()->isVisible()))
        return QStringLiteral("a dialog of a hidden window shows");
    return list()->getMoveState() ? QString() : glanceAtList();
}

// The list, its records and the order file tell the same.
QString tst_titlerwindow_monkey::glanceAtList() const
{
    const QString folder = list()->getCurrentPath();
    if (list()->count() > 99)
        return QString("%1 titles").arg(list()->count());
    if (folder.isEmpty() || !QFileInfo(folder).isDir())
        return {};
    QStringList listed;
    for (int i = 0; i < list()->count(); ++i) {
        const QFileInfo file(list()->archiveItem(i)->getArchiveDataPath());
        if (file.path() != folder)
            return file.filePath() + " in the list of " + folder;
        listed.append(file.completeBaseName());
    }
    if (const QStringList order = LibraryFixture::order(folder); order != listed)
        return QString("%1: in the list %2; in its order file %3")
            .arg(folder, listed.join(' '), order.join(' '));
    const ArchiveItem* selected = list()->getSelectedArchive();
    const Archive* shown = scene()->archive();
    if (selected && (!shown || QString::fromStdString(shown->getPath()) != selected->getArchiveDataPath()))
        return QString("selected %1, on the canvas %2")
            .arg(selected->getArchiveDataPath(),
                 shown ? QString::fromStdString(shown->getPath()) : QStringLiteral("nothing"));
    return {};
}

QString tst_titlerwindow_monkey::lookAtDisk(bool withPictures)
{
    return mAccount.look(withPictures);
}

void tst_titlerwindow_monkey::report(qint64 milliseconds) const
{
    fprintf(stderr, "seed %u: %d touches in %.1f s, checksum %08x\n", mSeed, mFingers->touches(),
            double(milliseconds) / 1000, mFingers->checksum());
    for (auto count = mCounts.begin(); count != mCounts.end(); ++count)
        fprintf(stderr, "%7d %s\n", count.value(), qPrintable(count.key()));
    fprintf(stderr, "%7d titles and %d pictures read, %d titles in %d folders left\n", mAccount.titlesRead(),
            mAccount.picturesRead(), mAccount.titlesNow(), int(mOthers->folders().size()));
}

void tst_titlerwindow_monkey::manyTouches()
{
    QElapsedTimer clock;
    clock.start();
    QCOMPARE(lookAtDisk(true), QString());
    QEventLoop loop;
    mLoop = &loop;
    // Something to read at every turn.
    const int always = ::eventfd(1, EFD_CLOEXEC);
    QVERIFY(always >= 0);
    {
        QSocketNotifier notifier(always, QSocketNotifier::Read);
        connect(&notifier, &QSocketNotifier::activated, this, &tst_titlerwindow_monkey::turn);
        MonkeyGround::Application::instance()->frozen = true;
        loop.exec();
        MonkeyGround::Application::instance()->frozen = false;
    }
    ::close(always);
    report(clock.elapsed());
    QVERIFY2(mFailure.isEmpty(), qPrintable(mFailure));
    const QString held = MonkeyGround::heldLocks();
    QVERIFY2(held.isEmpty(), qPrintable(held + '\n' + mFingers->lastTouches().join('\n')));

    if (mWindow->isVisible()) {
        QTRY_VERIFY(mWindow->dataSaveIsFinished());
        mWindow->closeTitlerWindow();
        if (mWindow->isVisible())
            mWindow->continueCloseTitler({1, MessageDefine::CLOSE_OK, MessageDef::MESSAGE_CONFIRM_CLOSE});
        QVERIFY(!mWindow->isVisible());
    }
    QVERIFY(FileSyncQueue::flush(std::chrono::seconds(60)));
    const QString wrong = lookAtDisk(true);
    QVERIFY2(wrong.isEmpty(), qPrintable(wrong));
    if (mTouches >= TOUCHES_FOR_ALL)
        QCOMPARE(missed().join(", "), QString());
}

int main(int argc, char** argv)
{
    HandClock::install();
    return MonkeyGround::run<tst_titlerwindow_monkey>(argc, argv);
}

#include "tst_titlerwindow_monkey.moc"

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

// The program polls its pictures once a second; here it polls again immediately.
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
    CanvasScene* scene() const { return m_window->findChild<CanvasScene*>(); }
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    FolderPicker* folders() const { return m_window->findChild<FolderPicker*>(); }
    TemplatePicker* templates() const { return m_window->findChild<TemplatePicker*>(); }
    template <class... Arguments>
    auto counting(const char* what)
    {
        return [this, what](Arguments...) { ++m_counts[QLatin1String(what)]; };
    }

    TemplateFixture m_files;
    TitleAccount m_account{m_files};
    Siblings m_siblings;
    SoftKeyboardStandIn m_keyboard;
    Counts m_counts;
    std::unique_ptr<OtherProcesses> m_others;
    std::unique_ptr<WindowFingers> m_fingers;
    TitlerWindow* m_window = nullptr;
    TouchDevice m_device;
    QEventLoop* m_loop = nullptr;
    QString m_failure;
    QStringList m_doings;
    quint32 m_seed = 0;
    int m_touches = 0;
    int m_nextGlance = 0;
    int m_nextLook = 0;
    int m_looks = 0;
};

void tst_titlerwindow_monkey::initTestCase()
{
    m_seed = RandomSeed(DEFAULT_SEED);
    m_touches = runLength("TITLER_TOUCHES", DEFAULT_TOUCHES);
    qInfo("seed %u, %d touches", m_seed, m_touches);
    MonkeyGround::showErrorsOnly();
    QLoggingCategory::setFilterRules(QStringLiteral("*.debug=false"));
    QVERIFY(m_siblings.listenOnFreePorts());
    m_files.resetTemplates();
    m_files.makePresets("templates_en", {"lower", "strap", QString::fromUtf8("速報")}, true);
    m_files.makePresets("templates_chs", {"xia", QString::fromUtf8("快讯")}, true);
    m_files.makeUserTemplates(5);
    makeFolders();
    m_window = makeWaitingWindow();
    KSInputContext::instance()->setKeyBoardController(&m_keyboard);
    EditContextController::getInstance()->resultCallBack(
        new FakeTitlerCallBack([this](const _CALLBACK_TITLER_PARAMTER& param) {
            ++m_counts[QStringLiteral("answers to the asker")];
            m_counts[QStringLiteral("titles in answers")] += param.count;
        }));
    m_others = std::make_unique<OtherProcesses>(m_siblings, m_files, m_account, m_counts, m_seed + 1);
    m_fingers = std::make_unique<WindowFingers>(*m_window, m_device, m_seed, m_keyboard, *m_others,
                                                m_files.titleRoot(), m_counts);
    countWhatHappens();
    countFolderEdits();
}

void tst_titlerwindow_monkey::cleanupTestCase()
{
    MonkeyGround::Application::instance()->frozen = false;
    KSInputContext::instance()->setKeyBoardController(nullptr);
    delete m_window;
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
        const QString folder = m_files.makeFolder(name);
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
    const auto* bar = m_window->findChild<ToolsBar*>();
    connect(bar, &ToolsBar::closeButtonClick, this, counting<>("closes"));
    connect(list(), &ArchiveList::deleteCommandSignal, this, counting<QUndoCommand*>("titles deleted"));
    for (const QAction* action : m_fingers->undoAndRedo()) {
        const char* what = action->text().startsWith(QLatin1String("Undo")) ? "undo" : "redo";
        connect(action, &QAction::triggered, this, counting<bool>(what));
    }
    // A title that was deleted is to go, and one that was made can be taken back.
    const auto mayGo = [this](const ArchiveItem* item) {
        const QFileInfo file(item ? item->getArchiveDataPath() : QString());
        m_account.titleMayGo(file.path(), file.completeBaseName());
    };
    connect(list(), &ArchiveList::deleteCommandSignal, this,
            [this, mayGo] { mayGo(list()->getCurrentOperationArchive()); });
    connect(list(), &ArchiveList::pasteCommandSignal, this,
            [this, mayGo] { mayGo(list()->getSelectedArchive()); });
    qApp->installEventFilter(this);
}

// Called during the commit, since its details are cleared afterwards.
void tst_titlerwindow_monkey::countFolderEdits()
{
    const FolderPicker* picker = folders();
    connect(picker->treeView()->treeDelegate(), &CustomTreeDelegete::signalLineEditCommitted, this,
            [this, picker](const QString& name) {
                if (!QFileInfo(m_files.titleRoot() + '/' + name).isDir())
                    return;
                if (picker->editAction() == FolderPicker::FOLDER_EDIT_CREATE)
                    ++m_counts["folders made"];
                else if (picker->editAction() == FolderPicker::FOLDER_EDIT_RENAME)
                    ++m_counts["folders renamed"];
                else if (picker->editAction() == FolderPicker::FOLDER_EDIT_DUPLICATE)
                    ++m_counts["folders duplicated"];
            });
}

bool tst_titlerwindow_monkey::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::Show && object->isWidgetType() && static_cast<QWidget*>(object)->isWindow())
        ++m_counts[QLatin1String(object->metaObject()->className()) + QStringLiteral(" shown")];
    return false;
}

// The fingers play at every turn of the event loop, and so in the loop of each dialog that they open.
void tst_titlerwindow_monkey::turn()
{
    if (m_failure.isEmpty() && !isEnough())
        play();
    else
        stop();
}

// A full run goes on until the rare events have happened, too.
bool tst_titlerwindow_monkey::isEnough() const
{
    const int touches = m_fingers->touches();
    return touches >= m_touches &&
           (m_touches < TOUCHES_FOR_ALL || touches >= m_touches * MOST_ROUNDS || missed().isEmpty());
}

QStringList tst_titlerwindow_monkey::missed() const
{
    QStringList missed;
    for (const char* what : MUST_HAPPEN)
        if (m_counts.value(QLatin1String(what)) == 0)
            missed.append(QLatin1String(what));
    return missed;
}

void tst_titlerwindow_monkey::play()
{
    for (int i = 0; i < TOUCHES_PER_FRAME && m_failure.isEmpty(); ++i) {
        const QWidget* dialog = QApplication::activeModalWidget();
        const bool isHidden = m_window->isHidden();
        m_fingers->step();
        if (!m_failure.isEmpty())
            return;
        if (!m_fingers->isTouching()) {
            if (const QString held = MonkeyGround::heldLocks(); !held.isEmpty())
                return fail(held);
        }
        if (m_fingers->touches() >= m_nextGlance) {
            m_nextGlance = m_fingers->touches() + TOUCHES_PER_GLANCE;
            if (const QString wrong = glance(); !wrong.isEmpty())
                return fail(wrong);
        }
        if (m_fingers->touches() >= m_nextLook) {
            m_nextLook = m_fingers->touches() + TOUCHES_PER_LOOK;
            if (const QString wrong = lookAtDisk(++m_looks % LOOKS_PER_PICTURE == 0); !wrong.isEmpty())
                return fail(wrong);
        }
        // A dialog that has closed must get its turn to end.
        if (dialog != QApplication::activeModalWidget() || isHidden != m_window->isHidden())
            return;
    }
}

// One dialog after the other ends, and then the loop that all began in.
void tst_titlerwindow_monkey::stop()
{
    m_fingers->end();
    if (QApplication::activeModalWidget() == templates() && templates()->isVisible())
        templates()->reject();
    else if (folders()->isVisible())
        folders()->done(QDialog::Rejected);
    else
        m_loop->quit();
}

void tst_titlerwindow_monkey::fail(const QString& what)
{
    m_failure = QString("seed %1, touch %2: %3\nthe last touches:\n%4")
                    .arg(m_seed)
                    .arg(m_fingers->touches())
                    .arg(what, m_fingers->lastTouches().join('\n'));
}

// Checks what must be true at any moment.
QString tst_titlerwindow_monkey::glance() const
{
    const QList<GraphicsText*> texts = scene()->getTextItemList();
    if (texts.size() > CanvasScene::MAX_TEXT_OBJECTS)
        return QString("%1 texts").arg(texts.size());
    for (const GraphicsText* text : texts)
        if (!inStep(*text))
            return "out of step: " + text->toPlainText();
    if (m_window->isHidden() && (folders()->isVisible() || templates()->isVisible()))
        return QStringLiteral("a dialog of a hidden window shows");
    return list()->getMoveState() ? QString() : glanceAtList();
}

// The list, its records and the order file agree.
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
    return m_account.look(withPictures);
}

void tst_titlerwindow_monkey::report(qint64 milliseconds) const
{
    fprintf(stderr, "seed %u: %d touches in %.1f s, checksum %08x\n", m_seed, m_fingers->touches(),
            double(milliseconds) / 1000, m_fingers->checksum());
    for (auto count = m_counts.begin(); count != m_counts.end(); ++count)
        fprintf(stderr, "%7d %s\n", count.value(), qPrintable(count.key()));
    fprintf(stderr, "%7d titles and %d pictures read, %d titles in %d folders left\n", m_account.titlesRead(),
            m_account.picturesRead(), m_account.titlesNow(), int(m_others->folders().size()));
}

void tst_titlerwindow_monkey::manyTouches()
{
    QElapsedTimer clock;
    clock.start();
    QCOMPARE(lookAtDisk(true), QString());
    QEventLoop loop;
    m_loop = &loop;
    // Writes a byte, so that every turn of the event loop has something to read.
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
    QVERIFY2(m_failure.isEmpty(), qPrintable(m_failure));
    const QString held = MonkeyGround::heldLocks();
    QVERIFY2(held.isEmpty(), qPrintable(held + '\n' + m_fingers->lastTouches().join('\n')));

    if (m_window->isVisible()) {
        QTRY_VERIFY(m_window->dataSaveIsFinished());
        m_window->closeTitlerWindow();
        if (m_window->isVisible())
            m_window->continueCloseTitler({1, MessageDefine::CLOSE_OK, MessageDef::MESSAGE_CONFIRM_CLOSE});
        QVERIFY(!m_window->isVisible());
    }
    QVERIFY(FileSyncQueue::flush(std::chrono::seconds(60)));
    const QString wrong = lookAtDisk(true);
    QVERIFY2(wrong.isEmpty(), qPrintable(wrong));
    if (m_touches >= TOUCHES_FOR_ALL)
        QCOMPARE(missed().join(", "), QString());
}

int main(int argc, char** argv)
{
    HandClock::install();
    return MonkeyGround::run<tst_titlerwindow_monkey>(argc, argv);
}

#include "tst_titlerwindow_monkey.moc"

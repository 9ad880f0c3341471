// A long random session in the window against a plain model: titles are created, copied, pasted, deleted,
// moved, selected, edited and saved as templates, and steps taken back and done again. After each step list,
// records, order file, pictures, selection and context list must be those of the model, and nothing that can
// be brought back may be gone from disk.
//
// TITLER_STEPS changes the length, TITLER_SEED the course.
#include "LibraryModel.h"
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/TitlerWindow.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "document/TitleParser.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "library/TemplatePicker.h"
#include "library/TemplateTab.h"
#include "messaging/services/ServiceFamilies.h"
#include "tests/app/Siblings.h"
#include "tests/library/TemplateFixture.h"
#include "tests/support/Patience.h"
#include "tests/support/RandomSeed.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QAction>
#include <QApplication>
#include <QCryptographicHash>
#include <QElapsedTimer>
#include <QLoggingCategory>
#include <QRandomGenerator>
#include <QTest>
#include <QTextCursor>
#include <QTimer>
#include <functional>
#include <sys/stat.h>

namespace
{

#if defined(__SANITIZE_ADDRESS__)
const int DEFAULT_STEPS = 1000;
#else
const int DEFAULT_STEPS = 5000;
#endif
const int STEPS_OF_A_SESSION = 400;
const int STEPS_BETWEEN_WAITS = 40; // in which pictures may lag behind
const int COMFORTABLE_COUNT = 8;    // titles in the list, around which the session moves
const long FILE_MANAGER = 36;
const long UPDATE_TITLER_STATUS = 72;
const char* const PICTURES[] = {"_1920.png", "_960.png", "_240.png", "_240S.png"};

// Tells whether a file was written anew.
struct Stamp {
    ino_t inode = 0;
    qint64 time = 0;
    qint64 size = -1; // no file

    static Stamp of(const QString& path)
    {
        struct stat status {
        };
        if (::stat(path.toLocal8Bit().constData(), &status) != 0)
            return {};
        return {status.st_ino, status.st_mtim.tv_sec * 1000000000LL + status.st_mtim.tv_nsec, status.st_size};
    }
    bool operator==(const Stamp&) const = default;
};

LibraryModel::Texts textsOf(const Archive& archive)
{
    LibraryModel::Texts texts;
    for (const TText* text : archive.text())
        texts[text->getTextObjectID()] = *text;
    return texts;
}

QByteArray describe(const LibraryModel::Texts& texts)
{
    QByteArrayList parts;
    for (const TText& text : texts)
        parts << QByteArray::number(text.getTextObjectID()) + ':' +
                     QByteArray::fromStdString(text.getText()) + '@' + QByteArray::number(text.getXValue()) +
                     ',' + QByteArray::number(text.getYValue());
    return parts.join(' ');
}

} // namespace

// Fails the check with what was being done.
#define CHECK(condition)                                                                                     \
    do {                                                                                                     \
        if (!(condition)) {                                                                                  \
            mFailure = QStringLiteral(#condition " at line %1").arg(__LINE__);                               \
            return false;                                                                                    \
        }                                                                                                    \
    } while (false)

class tst_titlerwindow_library : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void randomSession();

private:
    bool step();
    bool createTitle();
    bool copyTitle();
    bool pasteTitle();
    bool deleteTitle();
    bool saveAsTemplate();
    bool moveTitle();
    bool focusTitle();
    bool newText();
    bool editText();
    bool moveText();
    bool deleteText();
    bool undoStep();
    bool redoStep();
    bool closeAndReopen();

    // Opens the menu on a title, or with -1 on the empty area, and chooses from it.
    bool choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row);
    bool takeNewTitle(const LibraryModel::Texts& texts, int behind);
    void type(GraphicsText* item, const QString& text);
    // The action ends the editing of a text: what was typed becomes a step of its own, and so does the
    // removal of texts that have been left blank.
    bool leaveText(bool deleteBlank, const std::function<void()>& action);
    bool leaveText()
    {
        return leaveText(true, [this] { mWindow->hideSoftWareWithDeleteEmptyItems(); });
    }
    bool takeCommands(int wanted);

    bool verify();
    bool verifyFiles(bool all);
    bool verifyPictures();
    bool verifyNotices();
    QSet<QString> toldTitles() const;
    bool waitForPictures();
    std::unique_ptr<Archive> read(const QString& stem) const;
    QString fileOf(const QString& stem) const { return mFolder + QLatin1Char('/') + stem + ".xml"; }
    QString stemOf(const ArchiveItem* item) const
    {
        return item ? QFileInfo(item->getArchiveDataPath()).completeBaseName() : QString();
    }
    int random(int bound) { return int(mRandom.bounded(quint32(bound))); }
    int randomRow() { return random(int(mModel.order.size())); }
    int randomTextId();
    void request();

    TemplateFixture mFixture;
    Siblings mSiblings;
    TitlerWindow* mWindow = nullptr;
    ArchiveList* mList = nullptr;
    CanvasScene* mScene = nullptr;
    TemplatePicker* mPicker = nullptr;
    ToolsBar* mBar = nullptr;
    QAction* mUndo = nullptr;
    QAction* mRedo = nullptr;
    int mTextCommands = 0; // that the canvas has pushed since they were last looked at

    QRandomGenerator mRandom;
    LibraryModel mModel;
    QMap<QString, LibraryModel::Texts> mTemplates; // the operator's
    int mTemplateNumber = 0;
    std::optional<LibraryModel::Texts> mCopy;
    std::optional<TText> mPending; // state before what is being typed
    QString mPendingText;
    QString mFolder;
    QString mFailure;
    QString mDoing;
    QStringList mLog;
    QMap<QString, Stamp> mStamps;
    QMap<QString, QByteArray> mPictureSums; // by path; of the stamp in mStamps
    QList<QPair<LibraryModel::Texts, QByteArrayList>> mKnownPictures;
    std::function<void()> mInDialog;
    int mDialogs = 0;
    int mComparedPictures = 0;
    int mTyped = 0;
};

void tst_titlerwindow_library::initTestCase()
{
    QLoggingCategory::setFilterRules("*.debug=false"); // else the test library stops printing
    QVERIFY(mSiblings.listenOnFreePorts());
    mFixture.resetTemplates();
    mFixture.makePresets("templates_en", {"lower", "strap", "速報"});
    mFixture.makePresets("templates_chs", {"xia"});
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    mWindow = new TitlerWindow(true, nullptr);
    pMainWindow = mWindow;
    mWindow->setRealClose(false);
    mList = mWindow->findChild<ArchiveList*>();
    mScene = mWindow->findChild<CanvasScene*>();
    mPicker = mWindow->findChild<TemplatePicker*>();
    mBar = mWindow->findChild<ToolsBar*>();
    for (QAction* action : mWindow->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly)) {
        if (action->text().startsWith("Undo"))
            mUndo = action;
        if (action->text().startsWith("Redo"))
            mRedo = action;
    }
    QVERIFY(mList && mScene && mPicker && mBar && mUndo && mRedo);
    // Nobody looks at the window: what it would paint costs more than all the rest.
    mWindow->setUpdatesEnabled(false);
    mPicker->setUpdatesEnabled(false);
    connect(mScene, &CanvasScene::signalPushUndoCommandIntoStack, this, [this] { ++mTextCommands; });
    // The dialog runs an event loop of its own: what is to be done in it is done from there.
    auto* watch = new QTimer(this);
    connect(watch, &QTimer::timeout, this, [this] {
        if (!mPicker->isVisible())
            return;
        ++mDialogs;
        if (mInDialog)
            std::exchange(mInDialog, nullptr)();
        mPicker->reject();
    });
    watch->start(0);
}

void tst_titlerwindow_library::cleanupTestCase()
{
    delete mWindow;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_library::request()
{
    mWindow->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, mFolder.toStdWString()});
}

void tst_titlerwindow_library::randomSession()
{
    const int steps = runLength("TITLER_STEPS", DEFAULT_STEPS);
    const RandomSeed seed(20261);
    mRandom.seed(seed);
    qInfo("seed %u", quint32(seed));
    QElapsedTimer timer;
    timer.start();

    mFolder = mFixture.makeFolder("property");
    LibraryFixture::fillFolder(mFolder, {"a", "b", "c"});
    for (const char* stem : {"a", "b", "c"})
        mModel.titles[stem].saved = textsOf(*read(stem));
    request();
    mModel.open({"a", "b", "c"});
    QVERIFY2(verify(), qPrintable(mFailure));

    for (int i = 1; i <= steps; ++i) {
        bool held = i % STEPS_OF_A_SESSION == 0 ? closeAndReopen() : step();
        held = held && (i % STEPS_BETWEEN_WAITS != 0 || waitForPictures()) && verify() &&
               (i % 100 != 0 || verifyFiles(true));
        mLog << QStringLiteral("%1 (%2 of %3)").arg(mDoing, mModel.canvas).arg(i);
        if (!held) {
            const qsizetype told = std::min<qsizetype>(mLog.size(), 30);
            QFAIL(qPrintable(QStringLiteral("seed %1, step %2: %3\nthe last steps:\n%4\nthe stack: %5")
                                 .arg(quint32(seed))
                                 .arg(i)
                                 .arg(mFailure, mLog.mid(mLog.size() - told).join('\n'), mModel.stack())));
        }
    }
    QVERIFY2(closeAndReopen() && verify() && verifyFiles(true) && verifyNotices(), qPrintable(mFailure));
    mWindow->closeTitlerWindow();
    QVERIFY(mComparedPictures > 0);
    qInfo("seed %u: %d steps, %d titles, %d dialogs, %d pictures compared, %lld ms", quint32(seed), steps,
          int(mModel.titles.size()), mDialogs, mComparedPictures, static_cast<long long>(timer.elapsed()));
}

bool tst_titlerwindow_library::step()
{
    // Long runs of undo and redo reach both ends of the stack.
    const int many = std::max(0, int(mModel.order.size()) - COMFORTABLE_COUNT);
    const QList<QPair<int, bool (tst_titlerwindow_library::*)()>> actions{
        {26, &tst_titlerwindow_library::undoStep},
        {20, &tst_titlerwindow_library::redoStep},
        {16, &tst_titlerwindow_library::focusTitle},
        {5, &tst_titlerwindow_library::createTitle},
        {5, &tst_titlerwindow_library::copyTitle},
        {7, &tst_titlerwindow_library::pasteTitle},
        {7 + 4 * many, &tst_titlerwindow_library::deleteTitle},
        {1, &tst_titlerwindow_library::saveAsTemplate},
        {10, &tst_titlerwindow_library::moveTitle},
        {3, &tst_titlerwindow_library::newText},
        {3, &tst_titlerwindow_library::editText},
        {2, &tst_titlerwindow_library::moveText},
        {2, &tst_titlerwindow_library::deleteText}};
    int total = 0;
    for (const auto& action : actions)
        total += action.first;
    int drawn = random(total);
    for (const auto& [weight, action] : actions) {
        if (drawn < weight)
            return (this->*action)();
        drawn -= weight;
    }
    return false;
}

bool tst_titlerwindow_library::takeCommands(int wanted)
{
    CHECK(std::exchange(mTextCommands, 0) == wanted);
    return true;
}

bool tst_titlerwindow_library::leaveText(bool deleteBlank, const std::function<void()>& action)
{
    const bool isActive = mScene->itemIsEditorInteraction() || mScene->itemIsSelectionMode();
    action();
    int pushed = 0;
    if (mPending) {
        ++pushed;
        const GraphicsText* item = mScene->findTextItem(mPending->getTextObjectID());
        CHECK(item);
        const std::unique_ptr<TText> after(item->getTextList());
        CHECK(QString::fromStdString(after->getText()) == mPendingText);
        mModel.editText(*mPending, *after);
        mPending.reset();
    }
    if (isActive && deleteBlank) {
        for (const int id : mModel.live.keys()) {
            if (!mModel.live.value(id).getText().empty())
                continue;
            ++pushed;
            mModel.deleteText(id);
        }
    }
    return takeCommands(pushed);
}

bool tst_titlerwindow_library::choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row)
{
    if (!leaveText(true, [this, row] {
            Q_EMIT mList->widgetItemRightPressed(mList->archiveItem(row), QPoint(300, 60), mList);
        }))
        return false;
    CHECK(mList->IsOptionMenuShowing());
    ArchiveAction* action = mList->findChild<ArchiveMenu*>()->action(type);
    CHECK(action->isEnabled());
    mList->slotHideOptionMenu();
    mList->selectOptionMenuItem(action);
    return takeCommands(0);
}

bool tst_titlerwindow_library::takeNewTitle(const LibraryModel::Texts& texts, int behind)
{
    const QString stem = stemOf(mList->getSelectedArchive());
    CHECK(!stem.isEmpty());
    CHECK(!mModel.titles.contains(stem));
    mModel.paste(stem, texts, behind);
    return true;
}

bool tst_titlerwindow_library::createTitle()
{
    const int row = random(8) == 0 || mModel.order.isEmpty() ? -1 : randomRow();
    const bool isUser = !mTemplates.isEmpty() && random(3) == 0;
    const bool isCancelled = random(6) == 0;
    LibraryModel::Texts texts;
    mInDialog = [this, isUser, isCancelled, &texts] {
        TemplateTab* tab = isUser ? mPicker->userTab() : mPicker->presetTab();
        mPicker->findChild<QTabWidget*>()->setCurrentIndex(isUser ? 1 : 0);
        tab->select(tab->item(random(tab->count())));
        texts = isUser ? mTemplates.value(TemplateTab::templateName(*tab->selectedArchive()))
                       : textsOf(*tab->selectedArchive());
        if (!isCancelled)
            mPicker->findChild<KSPushbutton*>(isUser ? "selectUserButton" : "selectPresetButton")->click();
    };
    const int dialogs = mDialogs;
    mDoing = QStringLiteral("create at %1%2").arg(row).arg(isCancelled ? " (cancelled)" : "");
    if (!choose(ArchiveAction::ACTION_CREATE, row))
        return false;
    CHECK(mDialogs == dialogs + 1);
    if (isCancelled)
        return true;
    return takeNewTitle(texts, row < 0 ? int(mModel.order.size()) - 1 : row);
}

bool tst_titlerwindow_library::copyTitle()
{
    mDoing = "copy nothing";
    if (mModel.order.isEmpty())
        return true;
    const int row = randomRow();
    mDoing = QStringLiteral("copy %1").arg(mModel.order.at(row));
    if (!choose(ArchiveAction::ACTION_COPY, row))
        return false;
    mCopy = mModel.titles.value(mModel.order.at(row)).saved;
    return true;
}

bool tst_titlerwindow_library::pasteTitle()
{
    mDoing = "paste nothing";
    if (!mCopy)
        return true;
    const int row = random(8) == 0 || mModel.order.isEmpty() ? -1 : randomRow();
    mDoing = QStringLiteral("paste at %1").arg(row);
    if (!choose(ArchiveAction::ACTION_PASTE, row))
        return false;
    return takeNewTitle(*mCopy, row < 0 ? int(mModel.order.size()) - 1 : row);
}

bool tst_titlerwindow_library::deleteTitle()
{
    mDoing = "delete nothing";
    if (mModel.order.isEmpty())
        return true;
    const int row = randomRow();
    mDoing = QStringLiteral("delete %1").arg(mModel.order.at(row));
    if (!choose(ArchiveAction::ACTION_DELETE, row))
        return false;
    mModel.remove(mModel.order.at(row));
    return true;
}

bool tst_titlerwindow_library::saveAsTemplate()
{
    mDoing = "save nothing as template";
    if (mModel.order.isEmpty())
        return true;
    const int row = randomRow();
    const QString stem = mModel.order.at(row);
    // The title on the canvas is waited for by the second.
    const bool waits = stem == mModel.selected && (mModel.pictureNeeded || mPending);
    if (waits && random(5) != 0)
        return true;
    mDoing = QStringLiteral("save %1 as template").arg(stem);
    if (stem == mModel.selected && !waits && !waitForPictures())
        return false;
    const int dialogs = mDialogs;
    if (!choose(ArchiveAction::ACTION_ADD_USER, row))
        return false;
    CHECK(mDialogs == dialogs + 1);
    if (stem == mModel.selected)
        mModel.leave();
    const QString name = QStringLiteral("UserTemplate_%1").arg(++mTemplateNumber, 3, 10, QLatin1Char('0'));
    Archive written;
    CHECK(TitleParser().readOneTitle(mFixture.userTitle(name).toStdString(), &written) == 1);
    mTemplates[name] = mModel.titles.value(stem).saved;
    CHECK(LibraryModel::isSame(textsOf(written), mTemplates.value(name)));
    CHECK(mPicker->userTab()->count() == mTemplates.size());
    CHECK(mFixture.userOrder().last() == name);
    return true;
}

bool tst_titlerwindow_library::moveTitle()
{
    mDoing = "move nothing";
    if (mModel.order.isEmpty())
        return true;
    const int from = randomRow();
    const int to = randomRow();
    mDoing = QStringLiteral("move %1 to %2").arg(from).arg(to);
    if (!leaveText()) // with the Move button
        return false;
    mWindow->editAndDoneButtonClicked();
    CHECK(mWindow->archiveListIsMoveMode());
    ArchiveItem* item = mList->archiveItem(from);
    Q_EMIT mList->signalDragOneItem(item, from, mList);
    mList->removeWidgetItem(item);
    mList->addWidgetItem(item, to);
    Q_EMIT mList->signalItemDrop();
    mWindow->editAndDoneButtonClicked();
    CHECK(!mWindow->archiveListIsMoveMode());
    mModel.move(from, to);
    return takeCommands(0);
}

bool tst_titlerwindow_library::focusTitle()
{
    mDoing = "focus nothing";
    if (mModel.order.isEmpty())
        return true;
    const int row = randomRow();
    mDoing = QStringLiteral("focus %1").arg(mModel.order.at(row));
    // The release over the list.
    if (!leaveText(false, [this] { mWindow->hideSoftWareWithOutDeleteEmptyItems(); }))
        return false;
    Q_EMIT mList->widgetItemReleased(mList->archiveItem(row), QPoint(300, 60), mList);
    mModel.focus(mModel.order.at(row));
    return takeCommands(0);
}

int tst_titlerwindow_library::randomTextId()
{
    const QList<int> ids = mModel.live.keys();
    return ids.isEmpty() ? 0 : ids.at(random(int(ids.size())));
}

void tst_titlerwindow_library::type(GraphicsText* item, const QString& text)
{
    item->setTextInteractionFlags(Qt::TextEditorInteraction);
    QTextCursor cursor = item->textCursor();
    cursor.movePosition(QTextCursor::End);
    cursor.insertText(text);
    mPendingText = item->toPlainText();
}

bool tst_titlerwindow_library::newText()
{
    mDoing = "new text";
    if (!leaveText())
        return false;
    if (mModel.canvas.isEmpty() || mModel.live.size() >= CanvasScene::MAX_TEXT_OBJECTS)
        return true;
    int id = 1;
    while (mModel.live.contains(id))
        ++id;
    mWindow->slotNewTextButtonClicked();
    if (!takeCommands(1))
        return false;
    GraphicsText* item = mScene->findTextItem(id);
    CHECK(item);
    const std::unique_ptr<TText> made(item->getTextList());
    mModel.createText(*made);
    type(item, QStringLiteral("新%1").arg(++mTyped));
    mPending = *made;
    if (random(3) == 0)
        return true; // what comes next ends it
    return leaveText();
}

bool tst_titlerwindow_library::editText()
{
    mDoing = "edit text";
    if (!leaveText())
        return false;
    const int id = randomTextId();
    if (id == 0)
        return true;
    GraphicsText* item = mScene->findTextItem(id);
    CHECK(item);
    mPending = mModel.live.value(id);
    type(item, QString(QChar('a' + random(26))));
    if (random(3) == 0)
        return true;
    return leaveText();
}

bool tst_titlerwindow_library::moveText()
{
    mDoing = "move text";
    if (!leaveText())
        return false;
    const int id = randomTextId();
    if (id == 0)
        return true;
    const QPointF from = LibraryModel::placeOf(mModel.live.value(id));
    const QPointF to(20 + random(1000), 20 + random(600));
    if (from == to)
        return true;
    mScene->slotCreateMoveUndoCommand(id, from, to);
    mModel.moveText(id, to);
    return takeCommands(1);
}

bool tst_titlerwindow_library::deleteText()
{
    mDoing = "delete text";
    if (!leaveText())
        return false;
    const int id = randomTextId();
    if (id == 0)
        return true;
    mScene->findTextItem(id)->changeItemToSolidLineState();
    mWindow->pressDelectButton();
    mModel.deleteText(id);
    return takeCommands(1);
}

bool tst_titlerwindow_library::undoStep()
{
    mDoing = "undo";
    if (!leaveText(false, [this] { Q_EMIT mBar->undoButtonClicked(); }))
        return false;
    Q_EMIT mBar->exeUndoAction();
    mModel.undo();
    return takeCommands(0);
}

bool tst_titlerwindow_library::redoStep()
{
    mDoing = "redo";
    if (!leaveText(false, [this] { Q_EMIT mBar->redoButtonClicked(); }))
        return false;
    Q_EMIT mBar->exeRedoAction();
    mModel.redo();
    return takeCommands(0);
}

bool tst_titlerwindow_library::closeAndReopen()
{
    mDoing = "close and reopen";
    // Most of the times all is written already; else the window waits by the second.
    if (random(4) != 0 && (!focusTitle() || !waitForPictures()))
        return false;
    if (!leaveText(false, [this] { mWindow->saveCurrentTitle(); }))
        return false;
    mWindow->closeTitlerWindow();
    mModel.leave();
    CHECK(!mWindow->isVisible());
    // Now that nothing can be brought back, the folder holds what the list held, and no picture beside it.
    QStringList stems;
    for (const QString& file : QDir(mFolder).entryList(QDir::Files))
        stems << file.section('_', 0, 0).section('.', 0, 0);
    stems.removeDuplicates();
    QStringList listed = mModel.order;
    listed.sort();
    stems.sort();
    CHECK(stems == listed);
    CHECK(mModel.order.isEmpty() || LibraryFixture::order(mFolder) == mModel.order);
    mCopy.reset();
    LibraryModel::Texts texts;
    if (mModel.order.isEmpty()) {
        mInDialog = [this, &texts] {
            TemplateTab* presets = mPicker->presetTab();
            mPicker->findChild<QTabWidget*>()->setCurrentIndex(0);
            presets->select(presets->item(0));
            texts = textsOf(*presets->selectedArchive());
            mPicker->findChild<KSPushbutton*>("selectPresetButton")->click();
        };
    }
    const QStringList kept = mModel.order;
    request();
    mModel.open(kept);
    return !kept.isEmpty() || takeNewTitle(texts, -1);
}

bool tst_titlerwindow_library::waitForPictures()
{
    CHECK(QTest::qWaitFor([this] { return mScene->isEditFinish(); }, PATIENCE_MS));
    return true;
}

std::unique_ptr<Archive> tst_titlerwindow_library::read(const QString& stem) const
{
    auto archive = std::make_unique<Archive>();
    if (TitleParser().readOneTitle(fileOf(stem).toStdString(), archive.get()) < 1)
        return nullptr;
    return archive;
}

bool tst_titlerwindow_library::verify()
{
    CHECK(mList->count() == mModel.order.size());
    for (int i = 0; i < mList->count(); ++i) {
        const ArchiveItem* item = mList->archiveItem(i);
        const QString stem = stemOf(item);
        CHECK(stem == mModel.order.at(i));
        if (mPending && stem == mModel.canvas)
            continue; // not a step yet
        if (!LibraryModel::isSame(textsOf(*item->getArchiveData()), mModel.titles.value(stem).saved)) {
            mFailure = QStringLiteral("record of %1: %2 instead of %3")
                           .arg(stem, describe(textsOf(*item->getArchiveData())),
                                describe(mModel.titles.value(stem).saved));
            return false;
        }
    }
    CHECK(LibraryFixture::order(mFolder) == mModel.order);
    CHECK(stemOf(mList->getSelectedArchive()) == mModel.selected);
    CHECK((mScene->archive()
               ? QFileInfo(QString::fromStdString(mScene->archive()->getPath())).completeBaseName()
               : QString()) == mModel.canvas);
    if (!mPending) {
        LibraryModel::Texts shown;
        for (const GraphicsText* item : mScene->getTextItemList()) {
            if (item->isEnabled()) {
                const std::unique_ptr<TText> text(item->getTextList());
                CHECK(!shown.contains(text->getTextObjectID()));
                shown[text->getTextObjectID()] = *text;
            }
        }
        if (!LibraryModel::isSame(shown, mModel.live)) {
            mFailure = QStringLiteral("canvas: %1 instead of %2").arg(describe(shown), describe(mModel.live));
            return false;
        }
    }
    for (auto title = mModel.titles.keyBegin(); title != mModel.titles.keyEnd(); ++title) {
        const bool isNew = EditContextController::getInstance()->isNewCreateFile(
            (*title + QStringLiteral(".xml")).toStdWString());
        CHECK(isNew == mModel.context.contains(*title));
    }
    CHECK(mUndo->isEnabled() == mModel.canUndo());
    CHECK(mRedo->isEnabled() == mModel.canRedo());
    return verifyFiles(false) && verifyPictures();
}

// All that can be brought back lies on disk as the model has it; without all, only what was written anew is
// read.
bool tst_titlerwindow_library::verifyFiles(bool all)
{
    for (const QString& stem : mModel.reachable()) {
        if (mPending && stem == mModel.canvas)
            continue;
        const Stamp stamp = Stamp::of(fileOf(stem));
        if (!all && stamp.size >= 0 && stamp == mStamps.value(fileOf(stem)))
            continue;
        const auto archive = read(stem);
        if (!archive || !LibraryModel::isSame(textsOf(*archive), mModel.titles.value(stem).saved)) {
            mFailure = QStringLiteral("file of %1: %2 instead of %3")
                           .arg(stem, archive ? describe(textsOf(*archive)) : "nothing",
                                describe(mModel.titles.value(stem).saved));
            return false;
        }
        mStamps[fileOf(stem)] = stamp;
    }
    return true;
}

// Titles with the same texts have the same pictures, whichever way they came to them.
bool tst_titlerwindow_library::verifyPictures()
{
    if (!mScene->isEditFinish())
        return true; // they are on their way
    for (const QString& stem : std::as_const(mModel.order)) {
        if (!mModel.hasCurrentPictures(stem))
            continue;
        QByteArrayList sums;
        bool changed = false;
        for (const char* suffix : PICTURES) {
            const QString path = mFolder + QLatin1Char('/') + stem + QLatin1String(suffix);
            const Stamp stamp = Stamp::of(path);
            CHECK(stamp.size > 0);
            if (!(stamp == mStamps.value(path))) {
                QFile file(path);
                CHECK(file.open(QIODevice::ReadOnly));
                mPictureSums[path] = QCryptographicHash::hash(file.readAll(), QCryptographicHash::Sha1);
                mStamps[path] = stamp;
                changed = true;
            }
            sums << mPictureSums.value(path);
        }
        if (!changed)
            continue;
        ++mComparedPictures;
        const LibraryModel::Texts& texts = mModel.titles[stem].saved;
        const auto known =
            std::find_if(mKnownPictures.cbegin(), mKnownPictures.cend(),
                         [&](const auto& entry) { return LibraryModel::isSame(entry.first, texts); });
        if (known == mKnownPictures.cend()) {
            mKnownPictures.append({texts, sums});
        } else if (known->second != sums) {
            mFailure = QStringLiteral("pictures of %1 do not show %2").arg(stem, describe(texts));
            return false;
        }
    }
    return true;
}

// What the file manager was told adds up to what lies in the folder.
bool tst_titlerwindow_library::verifyNotices()
{
    const QSet<QString> wanted(mModel.order.begin(), mModel.order.end());
    const bool agree = QTest::qWaitFor([this, &wanted] { return toldTitles() == wanted; }, PATIENCE_MS);
    CHECK(agree);
    return true;
}

QSet<QString> tst_titlerwindow_library::toldTitles() const
{
    QSet<QString> stems{"a", "b", "c"};
    for (QByteArray arguments : mSiblings.argumentsOf(FILE_MANAGER, UPDATE_TITLER_STATUS)) {
        FileManagerDefine::tagTitleChangeStatusParam notice;
        FileManagerControllerParams::deserialize_updateTitlerStatus_param(notice, arguments.data(),
                                                                          long(arguments.size()));
        const QString stem = QFileInfo(QString::fromStdWString(notice.path)).completeBaseName();
        if (notice.changeType == FileManagerDefine::TITLE_ADDED)
            stems << stem;
        else if (notice.changeType == FileManagerDefine::TITLE_DELETED)
            stems.remove(stem);
    }
    return stems;
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    QApplication::setQuitOnLastWindowClosed(false);
    tst_titlerwindow_library test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow_library.moc"

#include "OperatorSession.h"

#include "FaultShim.h"
#include "app/APPEventFilter.h"
#include "app/ShowMessageController.h"
#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "library/FolderEditor.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "library/TemplateTab.h"
#include "messaging/services/ServiceFamilies.h"
#include "support/FileSyncQueue.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QApplication>
#include <QDeadlineTimer>
#include <QDir>
#include <QDirIterator>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QTabWidget>
#include <QTextCursor>
#include <QThread>
#include <QTimer>
#include <unistd.h>

const QString OperatorSession::FOLDER = QStringLiteral("news");
const QString OperatorSession::MADE_FOLDER = QStringLiteral("sport");
const QString OperatorSession::RENAMED_FOLDER = QStringLiteral("sports");
const QString OperatorSession::COPIED_FOLDER = QStringLiteral("copies");
const QStringList OperatorSession::STEMS{"a", "b", "c", "d"};
const QString OperatorSession::PRESET_TEXT = QStringLiteral("lower");
const QString OperatorSession::USER_TEXT = QStringLiteral("strap");

namespace
{

constexpr long MESSAGE_CENTER = 65;
constexpr int MOST_ARRIVAL = 20000; // ms; of a call at the sibling
// ms. Where the disk refuses, titles may never be saved: once that was seen, less is waited for it.
constexpr int SETTLE_TIMEOUT = 3000;
constexpr int SETTLE_TIMEOUT_LATER = 300;
constexpr std::chrono::seconds SYNC_TIMEOUT(4);
constexpr int DIALOG_WATCH = 1; // ms
constexpr int CLOSE_ATTEMPTS = 4;
constexpr int SESSIONS_PER_LOOK = 5;

long residentKilobytes()
{
    QFile status(QStringLiteral("/proc/self/statm"));
    if (!status.open(QIODevice::ReadOnly))
        return -1;
    return status.readAll().split(' ').value(1).toLong() * ::sysconf(_SC_PAGESIZE) / 1024;
}

int filesBelow(const QString& folder)
{
    int count = 0;
    for (QDirIterator files(folder, QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
         files.hasNext(); files.next())
        ++count;
    return count;
}

} // namespace

OperatorSession::OperatorSession(const QString& titleRoot) : mRoot(titleRoot)
{
    if (!mSiblings.listenOnFreePorts())
        return;
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    mWindow = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = mWindow.get();
    mWindow->setRealClose(false);
    mList = mWindow->findChild<ArchiveList*>();
    mScene = mWindow->findChild<CanvasScene*>();
    mFolders = mWindow->findChild<FolderPicker*>();
    mTemplates = mWindow->findChild<TemplatePicker*>();
    // Nobody looks: what they would paint costs more than all the rest.
    for (QWidget* widget : {static_cast<QWidget*>(mWindow.get()), static_cast<QWidget*>(mFolders),
                            static_cast<QWidget*>(mTemplates)})
        widget->setUpdatesEnabled(false);
    watchDialogs();
}

OperatorSession::~OperatorSession()
{
    mWindow.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

// A dialog runs a loop of its own; what is to be done in it is done from there, once, and then it is left.
// One that is opened by that has its turn, too: each look comes from a timer of its own.
void OperatorSession::watchDialogs()
{
    QTimer::singleShot(DIALOG_WATCH, this, &OperatorSession::watchDialogs);
    if (mTemplates->isVisible()) {
        if (auto action = std::exchange(mInTemplates, nullptr))
            action();
        if (mTemplates->isVisible())
            mTemplates->reject();
    } else if (mFolders->isVisible()) {
        if (auto action = std::exchange(mInFolders, nullptr))
            action();
        else
            mFolders->done(QDialog::Rejected);
    }
}

void OperatorSession::step(const char* name, const std::function<void()>& action,
                           const Journal::Folders& foreseen)
{
    report("begin", name, foreseen.isEmpty() ? mKnown : foreseen);
    QElapsedTimer clock;
    clock.start();
    action();
    settle();
    noteList();
    report("done", name, mKnown);
    if (qEnvironmentVariableIsSet("FAULTS_TIMES"))
        fprintf(stderr, "%5lld ms %s\n", static_cast<long long>(clock.elapsed()), name);
}

void OperatorSession::report(const char* phase, const char* name, const Journal::Folders& folders)
{
    Journal::write({{phase, name},
                    {"folders", Journal::toJson(folders)},
                    {"told", told()},
                    {"count", double(FaultShim::count())},
                    {"hit", QString::fromLocal8Bit(FaultShim::hit())}});
}

// Returns the numbers of the messages that the operator was shown. They arrive through a socket: waits for a
// call that is sent behind them and that no other call equals.
QJsonArray OperatorSession::told()
{
    using Proxy = MessageCenterRemoteProxy;
    const auto mark = static_cast<MessageDefine::_emTopWindow>(++mLastMark);
    ShowMessageController::getInstance()->changeTopWindow(mark);
    const QDeadlineTimer limit(MOST_ARRIVAL);
    const auto hasArrived = [&] {
        QByteArray arguments = mSiblings.lastArguments(MESSAGE_CENTER, Proxy::METHOD_setTopWindow);
        MessageDefine::_tagTopWindowParam window{};
        MessageCenterParams::deserialize_setTopWindow_param(window, arguments.data(), long(arguments.size()));
        return window.topWindow == mark;
    };
    while (!hasArrived() && !limit.hasExpired())
        QThread::msleep(1);
    QJsonArray numbers;
    for (QByteArray arguments : mSiblings.argumentsOf(MESSAGE_CENTER, Proxy::METHOD_postMessage)) {
        MessageDefine::_tagMessageParam message;
        MessageCenterParams::deserialize_postMessage_param(message, arguments.data(), long(arguments.size()));
        numbers.append(message.messageId);
    }
    return numbers;
}

// The open folder as its list shows it.
void OperatorSession::noteList()
{
    if (mOpen.isEmpty() || mList->getCurrentPath() != mRoot + '/' + mOpen)
        return;
    QStringList order;
    for (int row = 0; row < mList->count(); ++row)
        order.append(QFileInfo(mList->archiveItem(row)->getArchiveDataPath()).completeBaseName());
    mKnown[mOpen].order = order;
}

// Until the pictures are written and on the disk, as far as it takes them.
void OperatorSession::settle()
{
    const QDeadlineTimer limit(mIsSlow ? SETTLE_TIMEOUT_LATER : SETTLE_TIMEOUT);
    for (;;) {
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        if (mWindow->dataSaveIsFinished())
            break;
        if (limit.hasExpired()) {
            mIsSlow = true;
            break;
        }
        QThread::msleep(2);
    }
    FileSyncQueue::flush(SYNC_TIMEOUT);
    QCoreApplication::processEvents();
}

void OperatorSession::request(const QString& folder)
{
    mOpen = folder;
    mWindow->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, (mRoot + '/' + folder).toStdWString()});
}

void OperatorSession::makePictures()
{
    request(FOLDER);
    settle();
    for (int row = 0; row < mList->count(); ++row) {
        tap(row);
        type(1, QStringLiteral("!"));
        leaveText();
        settle();
    }
    close(false);
}

void OperatorSession::play(bool healBeforeClose)
{
    for (const QString& stem : STEMS)
        mKnown[FOLDER].texts[stem] = QStringList{stem + '!'};
    mKnown[FOLDER].order = STEMS;
    FaultShim::start();
    inEditor(healBeforeClose);
    if (healBeforeClose)
        FaultShim::start();
    inFolderPicker(healBeforeClose);
    FaultShim::stop();
    mIsSlow = false;
    Journal::write({{"played", true}});
}

// What happens in a folder that a sibling asked for.
void OperatorSession::inEditor(bool healBeforeClose)
{
    step("open", [this] { request(FOLDER); });
    const auto typed = [this](int row, const QString& stem, const QString& text) {
        const QStringList texts{mKnown[FOLDER].texts.value(stem).value(0) + text};
        step(
            "type",
            [this, row, stem, text, texts] {
                tap(row);
                type(1, text);
                leaveText();
                mKnown[FOLDER].texts[stem] = texts;
            },
            withTexts(stem, texts));
    };
    typed(0, STEMS.at(0), QStringLiteral(" one"));
    typed(1, STEMS.at(1), QStringLiteral(" two"));
    step("copy and paste", [this] {
        const QStringList before = mKnown[FOLDER].order;
        choose(ArchiveAction::ACTION_COPY, 0);
        choose(ArchiveAction::ACTION_PASTE, 0);
        noteNewTitle(before, mKnown[FOLDER].texts.value(STEMS.at(0)));
    });
    for (const bool ofUser : {false, true}) {
        step(ofUser ? "create from a user's template" : "create from a preset", [this, ofUser] {
            const QStringList before = mKnown[FOLDER].order;
            mInTemplates = [this, ofUser] { takeTemplate(ofUser); };
            choose(ArchiveAction::ACTION_CREATE, 0);
            noteNewTitle(before, {ofUser ? USER_TEXT : PRESET_TEXT});
        });
    }
    Journal::Folders without = mKnown;
    without[FOLDER].order.removeOne(STEMS.at(2));
    step(
        "delete",
        [this] { choose(ArchiveAction::ACTION_DELETE, int(mKnown[FOLDER].order.indexOf(STEMS.at(2)))); },
        without);
    step("move", [this] { move(0, 2); });
    step("save as template", [this] { choose(ArchiveAction::ACTION_ADD_USER, 0); });
    step("close", [this, healBeforeClose] { close(healBeforeClose); });
}

// What happens when the sub panel asks for the window.
void OperatorSession::inFolderPicker(bool healBeforeClose)
{
    step("make a folder", [this] {
        const QStringList before = mKnown.value(MADE_FOLDER).order;
        mInFolders = [this] {
            makeFolder(MADE_FOLDER);
            mInFolders = [this] {
                mOpen = MADE_FOLDER;
                mInTemplates = [this] { takeTemplate(false); };
                mFolders->openFolder();
            };
        };
        mWindow->showTitlerWindow({_titler_paramter::SUB_PANEL, {}});
        settle();
        if (QFileInfo(mRoot + '/' + MADE_FOLDER).isDir())
            mKnown[MADE_FOLDER];
        noteNewTitle(before, {PRESET_TEXT});
    });
    step("close", [this, healBeforeClose] { close(healBeforeClose); });
    step("duplicate and rename folders", [this, healBeforeClose] {
        mInFolders = [this] {
            const QModelIndex source = rowOf(FOLDER);
            if (!source.isValid())
                return;
            mFolders->treeView()->setCurrentIndex(source);
            mFolders->duplicateFolder();
            nameFolder(COPIED_FOLDER);
            mInFolders = [this] {
                const QModelIndex row = rowOf(MADE_FOLDER);
                if (!row.isValid())
                    return;
                mFolders->treeView()->setCurrentIndex(row);
                mFolders->startEditing(row);
                nameFolder(RENAMED_FOLDER);
            };
        };
        mWindow->showTitlerWindow({_titler_paramter::SUB_PANEL, {}});
        settle();
        if (rowOf(COPIED_FOLDER).isValid())
            mKnown[COPIED_FOLDER] = mKnown.value(FOLDER);
        if (rowOf(RENAMED_FOLDER).isValid() && mKnown.contains(MADE_FOLDER))
            mKnown[RENAMED_FOLDER] = mKnown.take(MADE_FOLDER);
        close(healBeforeClose);
    });
}

void OperatorSession::look()
{
    const QStringList folders = QDir(mRoot).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    for (const QString& folder : folders) {
        // An operator who finds the folder empty makes a first title.
        mInTemplates = [this] { takeTemplate(false); };
        request(folder);
        settle();
        noteList();
        for (int row = 0; row < mList->count(); ++row) {
            tap(row);
            settle();
        }
        if (mList->count() > 0)
            tap(0);
        close(false);
        mInTemplates = nullptr;
    }
    Journal::write({{"looked", true}, {"folders", Journal::toJson(mKnown)}, {"told", told()}});
}

void OperatorSession::soak(int sessions)
{
    for (int number = 1; number <= sessions; ++number) {
        request(FOLDER);
        settle();
        for (int row = 0; row < 2; ++row) {
            tap(row);
            // Longer and shorter by turns, so that the titles stay what they are.
            GraphicsText* item = mScene->findTextItem(1);
            if (!item)
                continue;
            item->setTextInteractionFlags(Qt::TextEditorInteraction);
            item->setPlainText(STEMS.at(row) + QString(number % 4, '+'));
            leaveText();
        }
        choose(ArchiveAction::ACTION_COPY, 0);
        choose(ArchiveAction::ACTION_PASTE, 0);
        settle();
        choose(ArchiveAction::ACTION_DELETE, 1);
        close(false);
        if (number % SESSIONS_PER_LOOK == 0)
            Journal::write({{"session", number},
                            {"kilobytes", double(residentKilobytes())},
                            {"descriptors", int(QDir("/proc/self/fd").count())},
                            {"threads", int(QDir("/proc/self/task").count())},
                            {"files", filesBelow(QFileInfo(mRoot).path())}});
    }
}

void OperatorSession::end()
{
    mWindow->endProcess();
}

// Whatever is asked, the operator wants to close.
void OperatorSession::close(bool healFirst)
{
    if (healFirst)
        FaultShim::stop();
    settle();
    for (int attempt = 0; attempt < CLOSE_ATTEMPTS && mWindow->isVisible(); ++attempt) {
        mWindow->closeTitlerWindow();
        settle();
        for (const auto answer : {MessageDefine::CLOSE_OK, MessageDefine::CLOSE_CANCEL}) {
            if (!mWindow->isVisible())
                break;
            mWindow->continueCloseTitler({1, answer, MessageDef::MESSAGE_CONFIRM_CLOSE});
            settle();
        }
    }
    if (mWindow->isVisible())
        Journal::write({{"wrong", "the window does not close"}});
    mOpen.clear();
}

void OperatorSession::tap(int row)
{
    if (ArchiveItem* item = mList->archiveItem(row))
        Q_EMIT mList->widgetItemReleased(item, QPoint(300, 60), mList);
}

void OperatorSession::type(int id, const QString& text)
{
    GraphicsText* item = mScene->findTextItem(id);
    if (!item)
        return;
    item->setTextInteractionFlags(Qt::TextEditorInteraction);
    QTextCursor cursor = item->textCursor();
    cursor.movePosition(QTextCursor::End);
    cursor.insertText(text);
}

void OperatorSession::leaveText()
{
    mWindow->hideSoftWareWithDeleteEmptyItems();
}

void OperatorSession::choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row)
{
    mList->itemRightPressedEvent(mList->archiveItem(row), QPoint(20, 20), mList);
    ArchiveAction* action = mList->findChild<ArchiveMenu*>()->action(type);
    mList->slotHideOptionMenu();
    if (action->isEnabled())
        mList->selectOptionMenuItem(action);
}

void OperatorSession::move(int from, int to)
{
    if (mList->count() <= std::max(from, to))
        return;
    leaveText();
    mWindow->editAndDoneButtonClicked();
    ArchiveItem* item = mList->archiveItem(from);
    Q_EMIT mList->signalDragOneItem(item, from, mList);
    mList->removeWidgetItem(item);
    mList->addWidgetItem(item, to);
    Q_EMIT mList->signalItemDrop();
    mWindow->editAndDoneButtonClicked();
}

void OperatorSession::takeTemplate(bool ofUser)
{
    mTemplates->findChild<QTabWidget*>()->setCurrentIndex(ofUser ? 1 : 0);
    TemplateTab* tab = ofUser ? mTemplates->userTab() : mTemplates->presetTab();
    if (tab->count() == 0)
        return;
    tab->select(tab->item(0));
    mTemplates->findChild<KSPushbutton*>(ofUser ? "selectUserButton" : "selectPresetButton")->click();
}

void OperatorSession::makeFolder(const QString& name)
{
    mFolders->createFolder();
    nameFolder(name);
}

void OperatorSession::nameFolder(const QString& name)
{
    QCoreApplication::sendPostedEvents();
    if (FolderEditor* editor = mFolders->editor()) {
        editor->setText(name);
        mFolders->slotPressedEnter();
    }
}

QModelIndex OperatorSession::rowOf(const QString& folder) const
{
    const KSTreeModel* model = mFolders->treeModel();
    for (int row = 0; row < model->rowCount(); ++row) {
        if (model->index(row, 0).data().toString() == folder)
            return model->index(row, 0);
    }
    return {};
}

void OperatorSession::noteNewTitle(const QStringList& before, const QStringList& texts)
{
    noteList();
    const QString folder = mOpen;
    for (const QString& stem : mKnown.value(folder).order) {
        if (!before.contains(stem))
            mKnown[folder].texts[stem] = texts;
    }
}

Journal::Folders OperatorSession::withTexts(const QString& stem, const QStringList& texts) const
{
    Journal::Folders folders = mKnown;
    folders[FOLDER].texts[stem] = texts;
    return folders;
}

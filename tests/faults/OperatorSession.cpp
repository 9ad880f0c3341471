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

OperatorSession::OperatorSession(const QString& titleRoot) : m_root(titleRoot)
{
    if (!m_siblings.listenOnFreePorts())
        return;
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = m_window.get();
    m_window->setRealClose(false);
    m_list = m_window->findChild<ArchiveList*>();
    m_scene = m_window->findChild<CanvasScene*>();
    m_folders = m_window->findChild<FolderPicker*>();
    m_templates = m_window->findChild<TemplatePicker*>();
    // Painting is switched off, since it would cost more than everything else and is not looked at.
    for (QWidget* widget : {static_cast<QWidget*>(m_window.get()), static_cast<QWidget*>(m_folders),
                            static_cast<QWidget*>(m_templates)})
        widget->setUpdatesEnabled(false);
    watchDialogs();
}

OperatorSession::~OperatorSession()
{
    m_window.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

// A dialog runs an event loop of its own. A timer carries out the action in it, once, and then closes it.
// Each dialog has a timer of its own, since an action may open another one.
void OperatorSession::watchDialogs()
{
    QTimer::singleShot(DIALOG_WATCH, this, &OperatorSession::watchDialogs);
    if (m_templates->isVisible()) {
        if (auto action = std::exchange(m_inTemplates, nullptr))
            action();
        if (m_templates->isVisible())
            m_templates->reject();
    } else if (m_folders->isVisible()) {
        if (auto action = std::exchange(m_inFolders, nullptr))
            action();
        else
            m_folders->done(QDialog::Rejected);
    }
}

void OperatorSession::step(const char* name, const std::function<void()>& action,
                           const Journal::Folders& foreseen)
{
    report("begin", name, foreseen.isEmpty() ? m_known : foreseen);
    QElapsedTimer clock;
    clock.start();
    action();
    settle();
    noteList();
    report("done", name, m_known);
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
    const auto mark = static_cast<MessageDefine::_emTopWindow>(++m_lastMark);
    ShowMessageController::getInstance()->changeTopWindow(mark);
    const QDeadlineTimer limit(MOST_ARRIVAL);
    const auto hasArrived = [&] {
        QByteArray arguments = m_siblings.lastArguments(MESSAGE_CENTER, Proxy::METHOD_setTopWindow);
        MessageDefine::_tagTopWindowParam window{};
        MessageCenterParams::deserialize_setTopWindow_param(window, arguments.data(), long(arguments.size()));
        return window.topWindow == mark;
    };
    while (!hasArrived() && !limit.hasExpired())
        QThread::msleep(1);
    QJsonArray numbers;
    for (QByteArray arguments : m_siblings.argumentsOf(MESSAGE_CENTER, Proxy::METHOD_postMessage)) {
        MessageDefine::_tagMessageParam message;
        MessageCenterParams::deserialize_postMessage_param(message, arguments.data(), long(arguments.size()));
        numbers.append(message.messageId);
    }
    return numbers;
}

// The open folder as its list shows it.
void OperatorSession::noteList()
{
    if (m_open.isEmpty() || m_list->getCurrentPath() != m_root + '/' + m_open)
        return;
    QStringList order;
    for (int row = 0; row < m_list->count(); ++row)
        order.append(QFileInfo(m_list->archiveItem(row)->getArchiveDataPath()).completeBaseName());
    m_known[m_open].order = order;
}

// Waits until the pictures are written and synced, as far as the disk accepts them.
void OperatorSession::settle()
{
    const QDeadlineTimer limit(m_isSlow ? SETTLE_TIMEOUT_LATER : SETTLE_TIMEOUT);
    for (;;) {
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        if (m_window->dataSaveIsFinished())
            break;
        if (limit.hasExpired()) {
            m_isSlow = true;
            break;
        }
        QThread::msleep(2);
    }
    FileSyncQueue::flush(SYNC_TIMEOUT);
    QCoreApplication::processEvents();
}

void OperatorSession::request(const QString& folder)
{
    m_open = folder;
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, (m_root + '/' + folder).toStdWString()});
}

void OperatorSession::makePictures()
{
    request(FOLDER);
    settle();
    for (int row = 0; row < m_list->count(); ++row) {
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
        m_known[FOLDER].texts[stem] = QStringList{stem + '!'};
    m_known[FOLDER].order = STEMS;
    FaultShim::start();
    inEditor(healBeforeClose);
    if (healBeforeClose)
        FaultShim::start();
    inFolderPicker(healBeforeClose);
    FaultShim::stop();
    m_isSlow = false;
    Journal::write({{"played", true}});
}

// What happens in a folder that a sibling asked for.
void OperatorSession::inEditor(bool healBeforeClose)
{
    step("open", [this] { request(FOLDER); });
    const auto typed = [this](int row, const QString& stem, const QString& text) {
        const QStringList texts{m_known[FOLDER].texts.value(stem).value(0) + text};
        step(
            "type",
            [this, row, stem, text, texts] {
                tap(row);
                type(1, text);
                leaveText();
                m_known[FOLDER].texts[stem] = texts;
            },
            withTexts(stem, texts));
    };
    typed(0, STEMS.at(0), QStringLiteral(" one"));
    typed(1, STEMS.at(1), QStringLiteral(" two"));
    step("copy and paste", [this] {
        const QStringList before = m_known[FOLDER].order;
        choose(ArchiveAction::ACTION_COPY, 0);
        choose(ArchiveAction::ACTION_PASTE, 0);
        noteNewTitle(before, m_known[FOLDER].texts.value(STEMS.at(0)));
    });
    for (const bool ofUser : {false, true}) {
        step(ofUser ? "create from a user's template" : "create from a preset", [this, ofUser] {
            const QStringList before = m_known[FOLDER].order;
            m_inTemplates = [this, ofUser] { takeTemplate(ofUser); };
            choose(ArchiveAction::ACTION_CREATE, 0);
            noteNewTitle(before, {ofUser ? USER_TEXT : PRESET_TEXT});
        });
    }
    Journal::Folders without = m_known;
    without[FOLDER].order.removeOne(STEMS.at(2));
    step(
        "delete",
        [this] { choose(ArchiveAction::ACTION_DELETE, int(m_known[FOLDER].order.indexOf(STEMS.at(2)))); },
        without);
    step("move", [this] { move(0, 2); });
    step("save as template", [this] { choose(ArchiveAction::ACTION_ADD_USER, 0); });
    step("close", [this, healBeforeClose] { close(healBeforeClose); });
}

// What happens when the sub panel asks for the window.
void OperatorSession::inFolderPicker(bool healBeforeClose)
{
    step("make a folder", [this] {
        const QStringList before = m_known.value(MADE_FOLDER).order;
        m_inFolders = [this] {
            makeFolder(MADE_FOLDER);
            m_inFolders = [this] {
                m_open = MADE_FOLDER;
                m_inTemplates = [this] { takeTemplate(false); };
                m_folders->openFolder();
            };
        };
        m_window->showTitlerWindow({_titler_paramter::SUB_PANEL, {}});
        settle();
        if (QFileInfo(m_root + '/' + MADE_FOLDER).isDir())
            m_known[MADE_FOLDER];
        noteNewTitle(before, {PRESET_TEXT});
    });
    step("close", [this, healBeforeClose] { close(healBeforeClose); });
    step("duplicate and rename folders", [this, healBeforeClose] {
        m_inFolders = [this] {
            const QModelIndex source = rowOf(FOLDER);
            if (!source.isValid())
                return;
            m_folders->treeView()->setCurrentIndex(source);
            m_folders->duplicateFolder();
            nameFolder(COPIED_FOLDER);
            m_inFolders = [this] {
                const QModelIndex row = rowOf(MADE_FOLDER);
                if (!row.isValid())
                    return;
                m_folders->treeView()->setCurrentIndex(row);
                m_folders->startEditing(row);
                nameFolder(RENAMED_FOLDER);
            };
        };
        m_window->showTitlerWindow({_titler_paramter::SUB_PANEL, {}});
        settle();
        if (rowOf(COPIED_FOLDER).isValid())
            m_known[COPIED_FOLDER] = m_known.value(FOLDER);
        if (rowOf(RENAMED_FOLDER).isValid() && m_known.contains(MADE_FOLDER))
            m_known[RENAMED_FOLDER] = m_known.take(MADE_FOLDER);
        close(healBeforeClose);
    });
}

void OperatorSession::look()
{
    const QStringList folders = QDir(m_root).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    for (const QString& folder : folders) {
        // An operator who finds the folder empty makes a first title.
        m_inTemplates = [this] { takeTemplate(false); };
        request(folder);
        settle();
        noteList();
        for (int row = 0; row < m_list->count(); ++row) {
            tap(row);
            settle();
        }
        if (m_list->count() > 0)
            tap(0);
        close(false);
        m_inTemplates = nullptr;
    }
    Journal::write({{"looked", true}, {"folders", Journal::toJson(m_known)}, {"told", told()}});
}

void OperatorSession::soak(int sessions)
{
    for (int number = 1; number <= sessions; ++number) {
        request(FOLDER);
        settle();
        for (int row = 0; row < 2; ++row) {
            tap(row);
            // Longer and shorter by turns, so that the titles stay what they are.
            GraphicsText* item = m_scene->findTextItem(1);
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
                            {"files", filesBelow(QFileInfo(m_root).path())}});
    }
}

void OperatorSession::end()
{
    m_window->endProcess();
}

// Answers every question so that the window closes.
void OperatorSession::close(bool healFirst)
{
    if (healFirst)
        FaultShim::stop();
    settle();
    for (int attempt = 0; attempt < CLOSE_ATTEMPTS && m_window->isVisible(); ++attempt) {
        m_window->closeTitlerWindow();
        settle();
        for (const auto answer : {MessageDefine::CLOSE_OK, MessageDefine::CLOSE_CANCEL}) {
            if (!m_window->isVisible())
                break;
            m_window->continueCloseTitler({1, answer, MessageDef::MESSAGE_CONFIRM_CLOSE});
            settle();
        }
    }
    if (m_window->isVisible())
        Journal::write({{"wrong", "the window does not close"}});
    m_open.clear();
}

void OperatorSession::tap(int row)
{
    if (ArchiveItem* item = m_list->archiveItem(row))
        Q_EMIT m_list->widgetItemReleased(item, QPoint(300, 60), m_list);
}

void OperatorSession::type(int id, const QString& text)
{
    GraphicsText* item = m_scene->findTextItem(id);
    if (!item)
        return;
    item->setTextInteractionFlags(Qt::TextEditorInteraction);
    QTextCursor cursor = item->textCursor();
    cursor.movePosition(QTextCursor::End);
    cursor.insertText(text);
}

void OperatorSession::leaveText()
{
    m_window->hideSoftWareWithDeleteEmptyItems();
}

void OperatorSession::choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row)
{
    m_list->itemRightPressedEvent(m_list->archiveItem(row), QPoint(20, 20), m_list);
    ArchiveAction* action = m_list->findChild<ArchiveMenu*>()->action(type);
    m_list->slotHideOptionMenu();
    if (action->isEnabled())
        m_list->selectOptionMenuItem(action);
}

void OperatorSession::move(int from, int to)
{
    if (m_list->count() <= std::max(from, to))
        return;
    leaveText();
    m_window->editAndDoneButtonClicked();
    ArchiveItem* item = m_list->archiveItem(from);
    Q_EMIT m_list->signalDragOneItem(item, from, m_list);
    m_list->removeWidgetItem(item);
    m_list->addWidgetItem(item, to);
    Q_EMIT m_list->signalItemDrop();
    m_window->editAndDoneButtonClicked();
}

void OperatorSession::takeTemplate(bool ofUser)
{
    m_templates->findChild<QTabWidget*>()->setCurrentIndex(ofUser ? 1 : 0);
    TemplateTab* tab = ofUser ? m_templates->userTab() : m_templates->presetTab();
    if (tab->count() == 0)
        return;
    tab->select(tab->item(0));
    m_templates->findChild<KSPushbutton*>(ofUser ? "selectUserButton" : "selectPresetButton")->click();
}

void OperatorSession::makeFolder(const QString& name)
{
    m_folders->createFolder();
    nameFolder(name);
}

void OperatorSession::nameFolder(const QString& name)
{
    QCoreApplication::sendPostedEvents();
    if (FolderEditor* editor = m_folders->editor()) {
        editor->setText(name);
        m_folders->slotPressedEnter();
    }
}

QModelIndex OperatorSession::rowOf(const QString& folder) const
{
    const KSTreeModel* model = m_folders->treeModel();
    for (int row = 0; row < model->rowCount(); ++row)
        if (model->index(row, 0).data().toString() == folder)
            return model->index(row, 0);
    return {};
}

void OperatorSession::noteNewTitle(const QStringList& before, const QStringList& texts)
{
    noteList();
    const QString folder = m_open;
    for (const QString& stem : m_known.value(folder).order)
        if (!before.contains(stem))
            m_known[folder].texts[stem] = texts;
}

Journal::Folders OperatorSession::withTexts(const QString& stem, const QStringList& texts) const
{
    Journal::Folders folders = m_known;
    folders[FOLDER].texts[stem] = texts;
    return folders;
}

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
            m_failure = QStringLiteral(#condition " at line %1").arg(__LINE__);                              \
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
        return leaveText(true, [this] { m_window->hideSoftWareWithDeleteEmptyItems(); });
    }
    bool takeCommands(int wanted);

    bool verify();
    bool verifyFiles(bool all);
    bool verifyPictures();
    bool verifyNotices();
    QSet<QString> toldTitles() const;
    bool waitForPictures();
    std::unique_ptr<Archive> read(const QString& stem) const;
    QString fileOf(const QString& stem) const { return m_folder + QLatin1Char('/') + stem + ".xml"; }
    QString stemOf(const ArchiveItem* item) const
    {
        return item ? QFileInfo(item->getArchiveDataPath()).completeBaseName() : QString();
    }
    int random(int bound) { return int(m_random.bounded(quint32(bound))); }
    int randomRow() { return random(int(m_model.order.size())); }
    int randomTextId();
    void request();

    TemplateFixture m_fixture;
    Siblings m_siblings;
    TitlerWindow* m_window = nullptr;
    ArchiveList* m_list = nullptr;
    CanvasScene* m_scene = nullptr;
    TemplatePicker* m_picker = nullptr;
    ToolsBar* m_bar = nullptr;
    QAction* m_undo = nullptr;
    QAction* m_redo = nullptr;
    int m_textCommands = 0; // that the canvas has pushed since they were last looked at

    QRandomGenerator m_random;
    LibraryModel m_model;
    QMap<QString, LibraryModel::Texts> m_templates; // the operator's
    int m_templateNumber = 0;
    std::optional<LibraryModel::Texts> m_copy;
    std::optional<TText> m_pending; // state before what is being typed
    QString m_pendingText;
    QString m_folder;
    QString m_failure;
    QString m_doing;
    QStringList m_log;
    QMap<QString, Stamp> m_stamps;
    QMap<QString, QByteArray> m_pictureSums; // by path; of the stamp in m_stamps
    QList<QPair<LibraryModel::Texts, QByteArrayList>> m_knownPictures;
    std::function<void()> m_inDialog;
    int m_dialogs = 0;
    int m_comparedPictures = 0;
    int m_typed = 0;
};

void tst_titlerwindow_library::initTestCase()
{
    QLoggingCategory::setFilterRules("*.debug=false"); // else the test library stops printing
    QVERIFY(m_siblings.listenOnFreePorts());
    m_fixture.resetTemplates();
    m_fixture.makePresets("templates_en", {"lower", "strap", "速報"});
    m_fixture.makePresets("templates_chs", {"xia"});
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_window = new TitlerWindow(true, nullptr);
    pMainWindow = m_window;
    m_window->setRealClose(false);
    m_list = m_window->findChild<ArchiveList*>();
    m_scene = m_window->findChild<CanvasScene*>();
    m_picker = m_window->findChild<TemplatePicker*>();
    m_bar = m_window->findChild<ToolsBar*>();
    for (QAction* action : m_window->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly)) {
        if (action->text().startsWith("Undo"))
            m_undo = action;
        if (action->text().startsWith("Redo"))
            m_redo = action;
    }
    QVERIFY(m_list && m_scene && m_picker && m_bar && m_undo && m_redo);
    // Painting is switched off, since it would cost more than everything else and is not looked at.
    m_window->setUpdatesEnabled(false);
    m_picker->setUpdatesEnabled(false);
    connect(m_scene, &CanvasScene::signalPushUndoCommandIntoStack, this, [this] { ++m_textCommands; });
    // The dialog runs an event loop of its own, in which the action is carried out.
    auto* watch = new QTimer(this);
    connect(watch, &QTimer::timeout, this, [this] {
        if (!m_picker->isVisible())
            return;
        ++m_dialogs;
        if (m_inDialog)
            std::exchange(m_inDialog, nullptr)();
        m_picker->reject();
    });
    watch->start(0);
}

void tst_titlerwindow_library::cleanupTestCase()
{
    delete m_window;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_library::request()
{
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, m_folder.toStdWString()});
}

void tst_titlerwindow_library::randomSession()
{
    const int steps = runLength("TITLER_STEPS", DEFAULT_STEPS);
    const RandomSeed seed(20261);
    m_random.seed(seed);
    qInfo("seed %u", quint32(seed));
    QElapsedTimer timer;
    timer.start();

    m_folder = m_fixture.makeFolder("property");
    LibraryFixture::fillFolder(m_folder, {"a", "b", "c"});
    for (const char* stem : {"a", "b", "c"})
        m_model.titles[stem].saved = textsOf(*read(stem));
    request();
    m_model.open({"a", "b", "c"});
    QVERIFY2(verify(), qPrintable(m_failure));

    for (int i = 1; i <= steps; ++i) {
        bool held = i % STEPS_OF_A_SESSION == 0 ? closeAndReopen() : step();
        held = held && (i % STEPS_BETWEEN_WAITS != 0 || waitForPictures()) && verify() &&
               (i % 100 != 0 || verifyFiles(true));
        m_log << QStringLiteral("%1 (%2 of %3)").arg(m_doing, m_model.canvas).arg(i);
        if (!held) {
            const qsizetype told = std::min<qsizetype>(m_log.size(), 30);
            QFAIL(
                qPrintable(QStringLiteral("seed %1, step %2: %3\nthe last steps:\n%4\nthe stack: %5")
                               .arg(quint32(seed))
                               .arg(i)
                               .arg(m_failure, m_log.mid(m_log.size() - told).join('\n'), m_model.stack())));
        }
    }
    QVERIFY2(closeAndReopen() && verify() && verifyFiles(true) && verifyNotices(), qPrintable(m_failure));
    m_window->closeTitlerWindow();
    QVERIFY(m_comparedPictures > 0);
    qInfo("seed %u: %d steps, %d titles, %d dialogs, %d pictures compared, %lld ms", quint32(seed), steps,
          int(m_model.titles.size()), m_dialogs, m_comparedPictures, static_cast<long long>(timer.elapsed()));
}

bool tst_titlerwindow_library::step()
{
    // Long runs of undo and redo reach both ends of the stack.
    const int many = std::max(0, int(m_model.order.size()) - COMFORTABLE_COUNT);
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
    CHECK(std::exchange(m_textCommands, 0) == wanted);
    return true;
}

bool tst_titlerwindow_library::leaveText(bool deleteBlank, const std::function<void()>& action)
{
    const bool isActive = m_scene->itemIsEditorInteraction() || m_scene->itemIsSelectionMode();
    action();
    int pushed = 0;
    if (m_pending) {
        ++pushed;
        const GraphicsText* item = m_scene->findTextItem(m_pending->getTextObjectID());
        CHECK(item);
        const std::unique_ptr<TText> after(item->getTextList());
        CHECK(QString::fromStdString(after->getText()) == m_pendingText);
        m_model.editText(*m_pending, *after);
        m_pending.reset();
    }
    if (isActive && deleteBlank) {
        for (const int id : m_model.live.keys()) {
            if (!m_model.live.value(id).getText().empty())
                continue;
            ++pushed;
            m_model.deleteText(id);
        }
    }
    return takeCommands(pushed);
}

bool tst_titlerwindow_library::choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row)
{
    if (!leaveText(true, [this, row] {
            Q_EMIT m_list->widgetItemRightPressed(m_list->archiveItem(row), QPoint(300, 60), m_list);
        }))
        return false;
    CHECK(m_list->IsOptionMenuShowing());
    ArchiveAction* action = m_list->findChild<ArchiveMenu*>()->action(type);
    CHECK(action->isEnabled());
    m_list->slotHideOptionMenu();
    m_list->selectOptionMenuItem(action);
    return takeCommands(0);
}

bool tst_titlerwindow_library::takeNewTitle(const LibraryModel::Texts& texts, int behind)
{
    const QString stem = stemOf(m_list->getSelectedArchive());
    CHECK(!stem.isEmpty());
    CHECK(!m_model.titles.contains(stem));
    m_model.paste(stem, texts, behind);
    return true;
}

bool tst_titlerwindow_library::createTitle()
{
    const int row = random(8) == 0 || m_model.order.isEmpty() ? -1 : randomRow();
    const bool isUser = !m_templates.isEmpty() && random(3) == 0;
    const bool isCancelled = random(6) == 0;
    LibraryModel::Texts texts;
    m_inDialog = [this, isUser, isCancelled, &texts] {
        TemplateTab* tab = isUser ? m_picker->userTab() : m_picker->presetTab();
        m_picker->findChild<QTabWidget*>()->setCurrentIndex(isUser ? 1 : 0);
        tab->select(tab->item(random(tab->count())));
        texts = isUser ? m_templates.value(TemplateTab::templateName(*tab->selectedArchive()))
                       : textsOf(*tab->selectedArchive());
        if (!isCancelled)
            m_picker->findChild<KSPushbutton*>(isUser ? "selectUserButton" : "selectPresetButton")->click();
    };
    const int dialogs = m_dialogs;
    m_doing = QStringLiteral("create at %1%2").arg(row).arg(isCancelled ? " (cancelled)" : "");
    if (!choose(ArchiveAction::ACTION_CREATE, row))
        return false;
    CHECK(m_dialogs == dialogs + 1);
    if (isCancelled)
        return true;
    return takeNewTitle(texts, row < 0 ? int(m_model.order.size()) - 1 : row);
}

bool tst_titlerwindow_library::copyTitle()
{
    m_doing = "copy nothing";
    if (m_model.order.isEmpty())
        return true;
    const int row = randomRow();
    m_doing = QStringLiteral("copy %1").arg(m_model.order.at(row));
    if (!choose(ArchiveAction::ACTION_COPY, row))
        return false;
    m_copy = m_model.titles.value(m_model.order.at(row)).saved;
    return true;
}

bool tst_titlerwindow_library::pasteTitle()
{
    m_doing = "paste nothing";
    if (!m_copy)
        return true;
    const int row = random(8) == 0 || m_model.order.isEmpty() ? -1 : randomRow();
    m_doing = QStringLiteral("paste at %1").arg(row);
    if (!choose(ArchiveAction::ACTION_PASTE, row))
        return false;
    return takeNewTitle(*m_copy, row < 0 ? int(m_model.order.size()) - 1 : row);
}

bool tst_titlerwindow_library::deleteTitle()
{
    m_doing = "delete nothing";
    if (m_model.order.isEmpty())
        return true;
    const int row = randomRow();
    m_doing = QStringLiteral("delete %1").arg(m_model.order.at(row));
    if (!choose(ArchiveAction::ACTION_DELETE, row))
        return false;
    m_model.remove(m_model.order.at(row));
    return true;
}

bool tst_titlerwindow_library::saveAsTemplate()
{
    m_doing = "save nothing as template";
    if (m_model.order.isEmpty())
        return true;
    const int row = randomRow();
    const QString stem = m_model.order.at(row);
    // The window polls the title on the canvas once a second.
    const bool waits = stem == m_model.selected && (m_model.pictureNeeded || m_pending);
    if (waits && random(5) != 0)
        return true;
    m_doing = QStringLiteral("save %1 as template").arg(stem);
    if (stem == m_model.selected && !waits && !waitForPictures())
        return false;
    const int dialogs = m_dialogs;
    if (!choose(ArchiveAction::ACTION_ADD_USER, row))
        return false;
    CHECK(m_dialogs == dialogs + 1);
    if (stem == m_model.selected)
        m_model.leave();
    const QString name = QStringLiteral("UserTemplate_%1").arg(++m_templateNumber, 3, 10, QLatin1Char('0'));
    Archive written;
    CHECK(TitleParser().readOneTitle(m_fixture.userTitle(name).toStdString(), &written) == 1);
    m_templates[name] = m_model.titles.value(stem).saved;
    CHECK(LibraryModel::isSame(textsOf(written), m_templates.value(name)));
    CHECK(m_picker->userTab()->count() == m_templates.size());
    CHECK(m_fixture.userOrder().last() == name);
    return true;
}

bool tst_titlerwindow_library::moveTitle()
{
    m_doing = "move nothing";
    if (m_model.order.isEmpty())
        return true;
    const int from = randomRow();
    const int to = randomRow();
    m_doing = QStringLiteral("move %1 to %2").arg(from).arg(to);
    if (!leaveText()) // with the Move button
        return false;
    m_window->editAndDoneButtonClicked();
    CHECK(m_window->archiveListIsMoveMode());
    ArchiveItem* item = m_list->archiveItem(from);
    Q_EMIT m_list->signalDragOneItem(item, from, m_list);
    m_list->removeWidgetItem(item);
    m_list->addWidgetItem(item, to);
    Q_EMIT m_list->signalItemDrop();
    m_window->editAndDoneButtonClicked();
    CHECK(!m_window->archiveListIsMoveMode());
    m_model.move(from, to);
    return takeCommands(0);
}

bool tst_titlerwindow_library::focusTitle()
{
    m_doing = "focus nothing";
    if (m_model.order.isEmpty())
        return true;
    const int row = randomRow();
    m_doing = QStringLiteral("focus %1").arg(m_model.order.at(row));
    // The release over the list.
    if (!leaveText(false, [this] { m_window->hideSoftWareWithOutDeleteEmptyItems(); }))
        return false;
    Q_EMIT m_list->widgetItemReleased(m_list->archiveItem(row), QPoint(300, 60), m_list);
    m_model.focus(m_model.order.at(row));
    return takeCommands(0);
}

int tst_titlerwindow_library::randomTextId()
{
    const QList<int> ids = m_model.live.keys();
    return ids.isEmpty() ? 0 : ids.at(random(int(ids.size())));
}

void tst_titlerwindow_library::type(GraphicsText* item, const QString& text)
{
    item->setTextInteractionFlags(Qt::TextEditorInteraction);
    QTextCursor cursor = item->textCursor();
    cursor.movePosition(QTextCursor::End);
    cursor.insertText(text);
    m_pendingText = item->toPlainText();
}

bool tst_titlerwindow_library::newText()
{
    m_doing = "new text";
    if (!leaveText())
        return false;
    if (m_model.canvas.isEmpty() || m_model.live.size() >= CanvasScene::MAX_TEXT_OBJECTS)
        return true;
    int id = 1;
    while (m_model.live.contains(id))
        ++id;
    m_window->slotNewTextButtonClicked();
    if (!takeCommands(1))
        return false;
    GraphicsText* item = m_scene->findTextItem(id);
    CHECK(item);
    const std::unique_ptr<TText> made(item->getTextList());
    m_model.createText(*made);
    type(item, QStringLiteral("新%1").arg(++m_typed));
    m_pending = *made;
    if (random(3) == 0)
        return true; // the next action ends it
    return leaveText();
}

bool tst_titlerwindow_library::editText()
{
    m_doing = "edit text";
    if (!leaveText())
        return false;
    const int id = randomTextId();
    if (id == 0)
        return true;
    GraphicsText* item = m_scene->findTextItem(id);
    CHECK(item);
    m_pending = m_model.live.value(id);
    type(item, QString(QChar('a' + random(26))));
    if (random(3) == 0)
        return true;
    return leaveText();
}

bool tst_titlerwindow_library::moveText()
{
    m_doing = "move text";
    if (!leaveText())
        return false;
    const int id = randomTextId();
    if (id == 0)
        return true;
    const QPointF from = LibraryModel::placeOf(m_model.live.value(id));
    const QPointF to(20 + random(1000), 20 + random(600));
    if (from == to)
        return true;
    m_scene->slotCreateMoveUndoCommand(id, from, to);
    m_model.moveText(id, to);
    return takeCommands(1);
}

bool tst_titlerwindow_library::deleteText()
{
    m_doing = "delete text";
    if (!leaveText())
        return false;
    const int id = randomTextId();
    if (id == 0)
        return true;
    m_scene->findTextItem(id)->changeItemToSolidLineState();
    m_window->pressDelectButton();
    m_model.deleteText(id);
    return takeCommands(1);
}

bool tst_titlerwindow_library::undoStep()
{
    m_doing = "undo";
    if (!leaveText(false, [this] { Q_EMIT m_bar->undoButtonClicked(); }))
        return false;
    Q_EMIT m_bar->exeUndoAction();
    m_model.undo();
    return takeCommands(0);
}

bool tst_titlerwindow_library::redoStep()
{
    m_doing = "redo";
    if (!leaveText(false, [this] { Q_EMIT m_bar->redoButtonClicked(); }))
        return false;
    Q_EMIT m_bar->exeRedoAction();
    m_model.redo();
    return takeCommands(0);
}

bool tst_titlerwindow_library::closeAndReopen()
{
    m_doing = "close and reopen";
    // Usually everything is written already; otherwise the window polls once a second.
    if (random(4) != 0 && (!focusTitle() || !waitForPictures()))
        return false;
    if (!leaveText(false, [this] { m_window->saveCurrentTitle(); }))
        return false;
    m_window->closeTitlerWindow();
    m_model.leave();
    CHECK(!m_window->isVisible());
    // Undo is not possible any more, so the folder holds the titles of the list and no other pictures.
    QStringList stems;
    for (const QString& file : QDir(m_folder).entryList(QDir::Files))
        stems << file.section('_', 0, 0).section('.', 0, 0);
    stems.removeDuplicates();
    QStringList listed = m_model.order;
    listed.sort();
    stems.sort();
    CHECK(stems == listed);
    CHECK(m_model.order.isEmpty() || LibraryFixture::order(m_folder) == m_model.order);
    m_copy.reset();
    LibraryModel::Texts texts;
    if (m_model.order.isEmpty()) {
        m_inDialog = [this, &texts] {
            TemplateTab* presets = m_picker->presetTab();
            m_picker->findChild<QTabWidget*>()->setCurrentIndex(0);
            presets->select(presets->item(0));
            texts = textsOf(*presets->selectedArchive());
            m_picker->findChild<KSPushbutton*>("selectPresetButton")->click();
        };
    }
    const QStringList kept = m_model.order;
    request();
    m_model.open(kept);
    return !kept.isEmpty() || takeNewTitle(texts, -1);
}

bool tst_titlerwindow_library::waitForPictures()
{
    CHECK(QTest::qWaitFor([this] { return m_scene->isEditFinish(); }, PATIENCE_MS));
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
    CHECK(m_list->count() == m_model.order.size());
    for (int i = 0; i < m_list->count(); ++i) {
        const ArchiveItem* item = m_list->archiveItem(i);
        const QString stem = stemOf(item);
        CHECK(stem == m_model.order.at(i));
        if (m_pending && stem == m_model.canvas)
            continue; // not a step yet
        if (!LibraryModel::isSame(textsOf(*item->getArchiveData()), m_model.titles.value(stem).saved)) {
            m_failure = QStringLiteral("record of %1: %2 instead of %3")
                            .arg(stem, describe(textsOf(*item->getArchiveData())),
                                 describe(m_model.titles.value(stem).saved));
            return false;
        }
    }
    CHECK(LibraryFixture::order(m_folder) == m_model.order);
    CHECK(stemOf(m_list->getSelectedArchive()) == m_model.selected);
    CHECK((m_scene->archive()
               ? QFileInfo(QString::fromStdString(m_scene->archive()->getPath())).completeBaseName()
               : QString()) == m_model.canvas);
    if (!m_pending) {
        LibraryModel::Texts shown;
        for (const GraphicsText* item : m_scene->getTextItemList()) {
            if (item->isEnabled()) {
                const std::unique_ptr<TText> text(item->getTextList());
                CHECK(!shown.contains(text->getTextObjectID()));
                shown[text->getTextObjectID()] = *text;
            }
        }
        if (!LibraryModel::isSame(shown, m_model.live)) {
            m_failure =
                QStringLiteral("canvas: %1 instead of %2").arg(describe(shown), describe(m_model.live));
            return false;
        }
    }
    for (auto title = m_model.titles.keyBegin(); title != m_model.titles.keyEnd(); ++title) {
        const bool isNew = EditContextController::getInstance()->isNewCreateFile(
            (*title + QStringLiteral(".xml")).toStdWString());
        CHECK(isNew == m_model.context.contains(*title));
    }
    CHECK(m_undo->isEnabled() == m_model.canUndo());
    CHECK(m_redo->isEnabled() == m_model.canRedo());
    return verifyFiles(false) && verifyPictures();
}

// Compares all titles that exist or can be restored with the files on the disk; without "all" only the files
// written since the last call are read.
bool tst_titlerwindow_library::verifyFiles(bool all)
{
    for (const QString& stem : m_model.reachable()) {
        if (m_pending && stem == m_model.canvas)
            continue;
        const Stamp stamp = Stamp::of(fileOf(stem));
        if (!all && stamp.size >= 0 && stamp == m_stamps.value(fileOf(stem)))
            continue;
        const auto archive = read(stem);
        if (!archive || !LibraryModel::isSame(textsOf(*archive), m_model.titles.value(stem).saved)) {
            m_failure = QStringLiteral("file of %1: %2 instead of %3")
                            .arg(stem, archive ? describe(textsOf(*archive)) : "nothing",
                                 describe(m_model.titles.value(stem).saved));
            return false;
        }
        m_stamps[fileOf(stem)] = stamp;
    }
    return true;
}

// Titles with the same texts have the same pictures, whatever edits led to them.
bool tst_titlerwindow_library::verifyPictures()
{
    if (!m_scene->isEditFinish())
        return true; // they are on their way
    for (const QString& stem : std::as_const(m_model.order)) {
        if (!m_model.hasCurrentPictures(stem))
            continue;
        QByteArrayList sums;
        bool changed = false;
        for (const char* suffix : PICTURES) {
            const QString path = m_folder + QLatin1Char('/') + stem + QLatin1String(suffix);
            const Stamp stamp = Stamp::of(path);
            CHECK(stamp.size > 0);
            if (!(stamp == m_stamps.value(path))) {
                QFile file(path);
                CHECK(file.open(QIODevice::ReadOnly));
                m_pictureSums[path] = QCryptographicHash::hash(file.readAll(), QCryptographicHash::Sha1);
                m_stamps[path] = stamp;
                changed = true;
            }
            sums << m_pictureSums.value(path);
        }
        if (!changed)
            continue;
        ++m_comparedPictures;
        const LibraryModel::Texts& texts = m_model.titles[stem].saved;
        const auto known =
            std::find_if(m_knownPictures.cbegin(), m_knownPictures.cend(),
                         [&](const auto& entry) { return LibraryModel::isSame(entry.first, texts); });
        if (known == m_knownPictures.cend()) {
            m_knownPictures.append({texts, sums});
        } else if (known->second != sums) {
            m_failure = QStringLiteral("pictures of %1 do not show %2").arg(stem, describe(texts));
            return false;
        }
    }
    return true;
}

// The reports to the file manager add up to the files in the folder.
bool tst_titlerwindow_library::verifyNotices()
{
    const QSet<QString> wanted(m_model.order.begin(), m_model.order.end());
    const bool agree = QTest::qWaitFor([this, &wanted] { return toldTitles() == wanted; }, PATIENCE_MS);
    CHECK(agree);
    return true;
}

QSet<QString> tst_titlerwindow_library::toldTitles() const
{
    QSet<QString> stems{"a", "b", "c"};
    for (QByteArray arguments : m_siblings.argumentsOf(FILE_MANAGER, UPDATE_TITLER_STATUS)) {
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

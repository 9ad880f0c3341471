// The end of a session in every state that it may be in, by every way to end it: what the operator saw is on
// disk, whole and nothing beside it.
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/TitlerPowerController.h"
#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "messaging/services/ServiceFamilies.h"
#include "support/FileSyncQueue.h"
#include "tests/app/Siblings.h"
#include "tests/fakes/FakeTitlerCallBack.h"
#include "tests/library/LibraryFixture.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSInputContext.h"

#include <QApplication>
#include <QDeadlineTimer>
#include <QMetaEnum>
#include <QSet>
#include <QTest>
#include <QTextCursor>
#include <QThread>
#include <chrono>

namespace
{

constexpr int ROW = 143;       // of the list, with the gap
constexpr int HANDLE_X = 523;  // in the list
constexpr int PICTURE_X = 150; // likewise
const long FILE_MANAGER = 36;
const long UPDATE_TITLER_STATUS = 72;
const char* const PICTURES[] = {"_1920.png", "_960.png", "_240.png", "_240S.png"};

// Text by object id.
using Texts = QMap<int, QString>;

} // namespace

class tst_titlerwindow_closing : public QObject
{
    Q_OBJECT

public:
    enum State {
        Idle,
        TextTyped,
        TextSelected,
        NewTextTyped,
        ObjectDragged,
        TitleCarried,
        MenuOpen,
        PicturesOnTheirWay,
        PasteDeletedAtOnce,
        DeletedAndUndone
    };
    Q_ENUM(State)
    enum Ending { Close, CloseAfterQuestion, AnswerOfCreation, PowerOff, Signal };
    Q_ENUM(Ending)

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void everyStateByEveryEnding_data();
    void everyStateByEveryEnding();
    void folderGone_data();
    void folderGone();
    void powerOffOverTheQuestion();
    void closeOverTheQuestion();

private:
    static bool isUnderTheFinger(State state)
    {
        return state == TextTyped || state == ObjectDragged || state == TitleCarried || state == MenuOpen;
    }
    void begin(Ending ending);
    void enter(State state);
    void end(Ending ending);
    void verifyReports();
    void verifyAnswer(Ending ending);
    void verifyDisk();

    void typeText(int id, const QString& text);
    void dragObject();
    void carryTitle();
    void tapTitle(int row);
    void choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row);
    void finger(QEventPoint::State state, const QWidget* widget, const QPoint& place);
    QAction* undoAction() const;

    Texts textsOnDisk(const QString& stem) const;
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    CanvasScene* scene() const { return m_window->findChild<CanvasScene*>(); }
    QStringList stems() const
    {
        QStringList result;
        for (int i = 0; i < list()->count(); ++i)
            result.append(QFileInfo(list()->archiveItem(i)->getArchiveDataPath()).completeBaseName());
        return result;
    }

    LibraryFixture m_fixture;
    Siblings m_siblings;
    TouchDevice m_device;
    std::unique_ptr<TitlerWindow> m_window;
    QString m_folder;
    Answers m_answers;
    QStringList m_made; // file names, in the order of making
    // What must be on disk at the end.
    QStringList m_order;
    QMap<QString, Texts> m_texts;
    QStringList m_changed; // these get new pictures
    QPointF m_draggedFrom;
};

void tst_titlerwindow_closing::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
}

void tst_titlerwindow_closing::init()
{
    APPEventFilter::instance();
    m_window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = m_window.get();
    m_window->setRealClose(false);
    m_folder = m_fixture.makeFolder(QStringLiteral("closing"));
    m_order = QStringList{"a", "b", "c"};
    LibraryFixture::fillFolder(m_folder, m_order);
    m_texts.clear();
    for (const QString& stem : m_order)
        m_texts[stem] = {{1, stem}};
    m_made.clear();
    m_changed.clear();
    m_draggedFrom = {};
    m_answers = {};
    m_siblings.forget();
}

void tst_titlerwindow_closing::cleanup()
{
    if (m_window && m_window->isVisible())
        m_window->endProcess();
    m_window.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_closing::everyStateByEveryEnding_data()
{
    QTest::addColumn<State>("state");
    QTest::addColumn<Ending>("ending");
    const QMetaEnum states = QMetaEnum::fromType<State>();
    const QMetaEnum endings = QMetaEnum::fromType<Ending>();
    for (int state = 0; state < states.keyCount(); ++state) {
        // The last two are one from there on.
        const int last = isUnderTheFinger(static_cast<State>(states.value(state))) ? Signal : PowerOff;
        for (int ending = 0; ending <= last; ++ending)
            QTest::addRow("%s, %s", states.key(state), endings.key(ending))
                << static_cast<State>(states.value(state)) << static_cast<Ending>(endings.value(ending));
    }
}

void tst_titlerwindow_closing::everyStateByEveryEnding()
{
    QFETCH(State, state);
    QFETCH(Ending, ending);
    begin(ending);
    enter(state);
    if (QTest::currentTestFailed())
        return;
    if (state != TitleCarried)
        m_order = stems();
    else if (ending == PowerOff || ending == Signal)
        m_order.move(1, 0); // nobody has dropped it
    end(ending);
    verifyReports();
    verifyAnswer(ending);
    if (ending == PowerOff || ending == Signal) // what was deleted goes with the next Close of the folder
        ArchiveController().deleteUnusefulArchives(m_folder);
    verifyDisk();
}

void tst_titlerwindow_closing::folderGone_data()
{
    QTest::addColumn<State>("state");
    QTest::addColumn<Ending>("ending");
    const QMetaEnum endings = QMetaEnum::fromType<Ending>();
    for (int ending = 0; ending < endings.keyCount(); ++ending) {
        for (const State state : {TextTyped, TitleCarried})
            QTest::addRow("%s, %d", endings.key(ending), state)
                << state << static_cast<Ending>(endings.value(ending));
    }
}

void tst_titlerwindow_closing::folderGone()
{
    QFETCH(State, state);
    QFETCH(Ending, ending);
    begin(ending);
    enter(state);
    if (QTest::currentTestFailed())
        return;
    QTRY_VERIFY(scene()->isEditFinish());            // or what is being written comes in between
    QTRY_VERIFY(QDir(m_folder).removeRecursively()); // a kept version may just be going
    end(ending);
    QVERIFY(!m_window->isVisible());
    QVERIFY(!QFileInfo::exists(m_folder)); // nor does it come back half
    QCOMPARE(m_answers.calls, ending == AnswerOfCreation ? 1 : 0);
    QCOMPARE(m_answers.paths, ending == AnswerOfCreation ? m_made : QStringList()); // as they were made
}

void tst_titlerwindow_closing::powerOffOverTheQuestion()
{
    begin(CloseAfterQuestion);
    enter(TextTyped);
    m_window->closeTitlerWindow();
    QVERIFY(m_window->isVisible());
    end(PowerOff);
    verifyAnswer(PowerOff);
    verifyDisk();
}

void tst_titlerwindow_closing::closeOverTheQuestion()
{
    begin(CloseAfterQuestion);
    enter(TextTyped);
    m_window->closeTitlerWindow();
    QVERIFY(m_window->isVisible());
    m_window->closeTitlerWindow(); // the question was for once
    QVERIFY(!m_window->isVisible());
    verifyDisk();
    // The answer comes late and finds nothing to do.
    m_window->continueCloseTitler({1, MessageDefine::CLOSE_OK, MessageDef::MESSAGE_CONFIRM_CLOSE});
    verifyAnswer(CloseAfterQuestion);
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, m_folder.toStdWString()});
    QCOMPARE(stems(), m_order);
}

// Opens the folder, and makes two titles in it, the second above the first.
void tst_titlerwindow_closing::begin(Ending ending)
{
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, m_folder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    QTRY_VERIFY(list()->archiveItem(2) && list()->archiveItem(2)->hasChildWidgets());
    QCOMPARE(stems(), m_order);
    EditContextController* context = EditContextController::getInstance();
    context->resultCallBack(new FakeTitlerCallBack(m_answers));
    if (ending == AnswerOfCreation)
        context->showTitlerCreate(3); // the window is open: only the context takes note
    choose(ArchiveAction::ACTION_COPY, 0);
    for (int i = 0; i < 2; ++i) {
        choose(ArchiveAction::ACTION_PASTE, 0);
        const QString stem = stems().at(1);
        m_made.append(stem + ".xml");
        m_texts[stem] = {{1, "a"}};
    }
    m_order = stems();
    QCOMPARE(m_order.size(), 5);
    list()->selectArchive(0);
}

// The file manager hears of the new pictures although no event loop runs any more after the end.
void tst_titlerwindow_closing::verifyReports()
{
    const auto reported = [this] {
        QSet<QString> stems;
        for (QByteArray arguments : m_siblings.argumentsOf(FILE_MANAGER, UPDATE_TITLER_STATUS)) {
            FileManagerDefine::tagTitleChangeStatusParam notice;
            FileManagerControllerParams::deserialize_updateTitlerStatus_param(notice, arguments.data(),
                                                                              long(arguments.size()));
            if (notice.changeType == FileManagerDefine::TITLE_PICTURES_CHANGED)
                stems.insert(QFileInfo(QString::fromStdWString(notice.path)).completeBaseName());
        }
        return stems.contains(QSet<QString>(m_changed.cbegin(), m_changed.cend()));
    };
    const QDeadlineTimer limit(PATIENCE_MS);
    while (!reported() && !limit.hasExpired())
        QThread::msleep(5);
    QVERIFY(reported());
}

void tst_titlerwindow_closing::verifyAnswer(Ending ending)
{
    QVERIFY(!m_window->isVisible());
    if (ending != AnswerOfCreation) {
        QCOMPARE(m_answers.calls, 0);
        return;
    }
    QCOMPARE(m_answers.calls, 1);
    QCOMPARE(m_answers.paths, (QStringList{m_made.at(1), m_made.at(0)})); // the order of the folder
}

void tst_titlerwindow_closing::verifyDisk()
{
    QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30))); // the versions before are kept until then
    QCOMPARE(LibraryFixture::order(m_folder), m_order);
    QSet<QString> known{".order.xml"};
    for (const QString& stem : std::as_const(m_order)) {
        QCOMPARE(textsOnDisk(stem), m_texts.value(stem));
        known.insert(stem + ".xml");
        for (const char* picture : PICTURES) {
            known.insert(stem + picture);
            if (m_changed.contains(stem))
                QVERIFY2(!QImage(m_folder + '/' + stem + picture).isNull(), picture);
        }
    }
    const QStringList files = QDir(m_folder).entryList(QDir::Files | QDir::Hidden);
    for (const QString& file : files)
        QVERIFY2(known.contains(file), qPrintable(file));
    if (m_draggedFrom.isNull())
        return;
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(m_folder + "/a.xml", &archive));
    const TText* text = archive.text().front();
    const QPointF saved(text->getXValue(), text->getYValue());
    QVERIFY((saved - m_draggedFrom).manhattanLength() < 0.1);
}

void tst_titlerwindow_closing::enter(State state)
{
    switch (state) {
    case Idle:
        break;
    case TextTyped:
        typeText(1, QStringLiteral(" 快讯"));
        m_texts["a"][1] += QStringLiteral(" 快讯");
        m_changed = QStringList{"a"};
        break;
    case TextSelected:
        typeText(1, QStringLiteral("!"));
        m_window->hideSoftWareWithDeleteEmptyItems();
        scene()->findTextItem(1)->setSelected(true);
        m_texts["a"][1] += QStringLiteral("!");
        m_changed = QStringList{"a"};
        break;
    case NewTextTyped:
        m_window->slotNewTextButtonClicked();
        typeText(2, QStringLiteral("second"));
        m_texts["a"][2] = scene()->findTextItem(2)->toPlainText();
        m_changed = QStringList{"a"};
        break;
    case ObjectDragged:
        dragObject();
        break;
    case TitleCarried:
        carryTitle();
        break;
    case MenuOpen:
        finger(QEventPoint::Pressed, list(), QPoint(PICTURE_X, ROW + 60));
        QTRY_VERIFY(list()->IsOptionMenuShowing());
        break;
    case PicturesOnTheirWay:
        for (int row = 0; row < list()->count(); ++row) {
            tapTitle(row);
            QCOMPARE(list()->getItemIndex(list()->getSelectedArchive()), row);
            const QString stem = m_order.at(row);
            typeText(1, QStringLiteral("+"));
            m_texts[stem][1] += QStringLiteral("+");
            m_changed.append(stem);
        }
        break;
    case PasteDeletedAtOnce:
        choose(ArchiveAction::ACTION_PASTE, 0);
        QCOMPARE(list()->count(), 6);
        choose(ArchiveAction::ACTION_DELETE, 1);
        QCOMPARE(stems(), m_order);
        break;
    case DeletedAndUndone:
        choose(ArchiveAction::ACTION_DELETE, 2);
        QCOMPARE(list()->count(), 4);
        undoAction()->trigger();
        QCOMPARE(stems(), m_order);
        break;
    }
}

void tst_titlerwindow_closing::end(Ending ending)
{
    switch (ending) {
    case Close:
        EditContextController::getInstance()->resultCallBack(nullptr);
        m_window->closeTitlerWindow();
        break;
    case CloseAfterQuestion:
        m_window->closeTitlerWindow();
        QVERIFY(m_window->isVisible());
        m_window->continueCloseTitler({1, MessageDefine::CLOSE_CANCEL, MessageDef::MESSAGE_CONFIRM_CLOSE});
        break;
    case AnswerOfCreation:
        m_window->closeTitlerWindow();
        break;
    case PowerOff:
        TitlerPowerController::getInstance()->powerOff();
        break;
    case Signal:
        m_window->endProcess();
        break;
    }
}

void tst_titlerwindow_closing::typeText(int id, const QString& text)
{
    GraphicsText* item = scene()->findTextItem(id);
    QVERIFY(item);
    item->setTextInteractionFlags(Qt::TextEditorInteraction);
    QTextCursor cursor = item->textCursor();
    cursor.movePosition(QTextCursor::End);
    cursor.insertText(text);
    QVERIFY(scene()->itemIsEditorInteraction());
}

void tst_titlerwindow_closing::finger(QEventPoint::State state, const QWidget* widget, const QPoint& place)
{
    const QPoint point = widget->mapTo(m_window.get(), place);
    auto touch = QTest::touchEvent(m_window.get(), m_device);
    if (state == QEventPoint::Pressed)
        touch.press(0, point);
    else if (state == QEventPoint::Released)
        touch.release(0, point);
    else
        touch.move(0, point);
}

// The finger stays down.
void tst_titlerwindow_closing::dragObject()
{
    auto* view = m_window->findChild<GraphicsView*>();
    const GraphicsText* item = scene()->findTextItem(1);
    const QPoint from = view->mapFromScene(item->sceneBoundingRect().center());
    finger(QEventPoint::Pressed, view, from);
    finger(QEventPoint::Released, view, from); // selects
    view->mouseClick();                        // no double tap follows
    QVERIFY(scene()->itemIsSelectionMode());
    const QPointF before = item->scenePos();
    finger(QEventPoint::Pressed, view, from);
    for (int step = 1; step <= 10; ++step)
        finger(QEventPoint::Updated, view, from + QPoint(12, 6) * step);
    QVERIFY(item->scenePos() != before);
    m_draggedFrom = before; // where an object returns that nobody has let go of
}

// To below the next title; the finger stays down.
void tst_titlerwindow_closing::carryTitle()
{
    m_window->editAndDoneButtonClicked();
    finger(QEventPoint::Pressed, list(), QPoint(HANDLE_X, 65));
    QTRY_VERIFY(list()->getMoveState());
    for (int step = 1; step <= 8; ++step)
        finger(QEventPoint::Updated, list(), QPoint(HANDLE_X, 65 + ROW * step / 8));
    m_order.move(0, 1);
}

void tst_titlerwindow_closing::tapTitle(int row)
{
    const QPoint place(PICTURE_X, row * ROW + 60);
    finger(QEventPoint::Pressed, list(), place);
    finger(QEventPoint::Released, list(), place);
}

void tst_titlerwindow_closing::choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row)
{
    list()->itemRightPressedEvent(list()->archiveItem(row), QPoint(20, 20), list());
    auto* menu = list()->findChild<ArchiveMenu*>();
    list()->selectOptionMenuItem(menu->action(type));
    list()->slotHideOptionMenu();
}

QAction* tst_titlerwindow_closing::undoAction() const
{
    for (QAction* action : m_window->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly))
        if (action->text().startsWith("Undo"))
            return action;
    return nullptr;
}

Texts tst_titlerwindow_closing::textsOnDisk(const QString& stem) const
{
    Archive archive;
    if (!ArchiveController().getOneArchive(m_folder + '/' + stem + ".xml", &archive))
        return {{0, QStringLiteral("unreadable")}};
    Texts texts;
    for (const TText* text : archive.text())
        texts[text->getTextObjectID()] = QString::fromStdString(text->getText());
    return texts;
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    QApplication::setQuitOnLastWindowClosed(false);
    tst_titlerwindow_closing test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow_closing.moc"

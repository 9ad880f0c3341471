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
    ArchiveList* list() const { return mWindow->findChild<ArchiveList*>(); }
    CanvasScene* scene() const { return mWindow->findChild<CanvasScene*>(); }
    QStringList stems() const
    {
        QStringList result;
        for (int i = 0; i < list()->count(); ++i)
            result.append(QFileInfo(list()->archiveItem(i)->getArchiveDataPath()).completeBaseName());
        return result;
    }

    LibraryFixture mFixture;
    Siblings mSiblings;
    TouchDevice mDevice;
    std::unique_ptr<TitlerWindow> mWindow;
    QString mFolder;
    Answers mAnswers;
    QStringList mMade; // file names, in the order of making
    // What must be on disk at the end.
    QStringList mOrder;
    QMap<QString, Texts> mTexts;
    QStringList mChanged; // these get new pictures
    QPointF mDraggedFrom;
};

void tst_titlerwindow_closing::initTestCase()
{
    QVERIFY(mSiblings.listenOnFreePorts());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
}

void tst_titlerwindow_closing::init()
{
    APPEventFilter::instance();
    mWindow = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = mWindow.get();
    mWindow->setRealClose(false);
    mFolder = mFixture.makeFolder(QStringLiteral("closing"));
    mOrder = QStringList{"a", "b", "c"};
    LibraryFixture::fillFolder(mFolder, mOrder);
    mTexts.clear();
    for (const QString& stem : mOrder)
        mTexts[stem] = {{1, stem}};
    mMade.clear();
    mChanged.clear();
    mDraggedFrom = {};
    mAnswers = {};
    mSiblings.forget();
}

void tst_titlerwindow_closing::cleanup()
{
    if (mWindow && mWindow->isVisible())
        mWindow->endProcess();
    mWindow.reset();
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
        mOrder = stems();
    else if (ending == PowerOff || ending == Signal)
        mOrder.move(1, 0); // nobody has dropped it
    end(ending);
    verifyReports();
    verifyAnswer(ending);
    if (ending == PowerOff || ending == Signal) // what was deleted goes with the next Close of the folder
        ArchiveController().deleteUnusefulArchives(mFolder);
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
    QTRY_VERIFY(scene()->isEditFinish());           // or what is being written comes in between
    QTRY_VERIFY(QDir(mFolder).removeRecursively()); // a kept version may just be going
    end(ending);
    QVERIFY(!mWindow->isVisible());
    QVERIFY(!QFileInfo::exists(mFolder)); // nor does it come back half
    QCOMPARE(mAnswers.calls, ending == AnswerOfCreation ? 1 : 0);
    QCOMPARE(mAnswers.paths, ending == AnswerOfCreation ? mMade : QStringList()); // as they were made
}

void tst_titlerwindow_closing::powerOffOverTheQuestion()
{
    begin(CloseAfterQuestion);
    enter(TextTyped);
    mWindow->closeTitlerWindow();
    QVERIFY(mWindow->isVisible());
    end(PowerOff);
    verifyAnswer(PowerOff);
    verifyDisk();
}

void tst_titlerwindow_closing::closeOverTheQuestion()
{
    begin(CloseAfterQuestion);
    enter(TextTyped);
    mWindow->closeTitlerWindow();
    QVERIFY(mWindow->isVisible());
    mWindow->closeTitlerWindow(); // the question was for once
    QVERIFY(!mWindow->isVisible());
    verifyDisk();
    // The answer comes late and finds nothing to do.
    mWindow->continueCloseTitler({1, MessageDefine::CLOSE_OK, MessageDef::MESSAGE_CONFIRM_CLOSE});
    verifyAnswer(CloseAfterQuestion);
    mWindow->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, mFolder.toStdWString()});
    QCOMPARE(stems(), mOrder);
}

// Opens the folder, and makes two titles in it, the second above the first.
void tst_titlerwindow_closing::begin(Ending ending)
{
    mWindow->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, mFolder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowActive(mWindow.get(), PATIENCE_MS));
    QTRY_VERIFY(list()->archiveItem(2) && list()->archiveItem(2)->hasChildWidgets());
    QCOMPARE(stems(), mOrder);
    EditContextController* context = EditContextController::getInstance();
    context->resultCallBack(new FakeTitlerCallBack(mAnswers));
    if (ending == AnswerOfCreation)
        context->showTitlerCreate(3); // the window is open: only the context takes note
    choose(ArchiveAction::ACTION_COPY, 0);
    for (int i = 0; i < 2; ++i) {
        choose(ArchiveAction::ACTION_PASTE, 0);
        const QString stem = stems().at(1);
        mMade.append(stem + ".xml");
        mTexts[stem] = {{1, "a"}};
    }
    mOrder = stems();
    QCOMPARE(mOrder.size(), 5);
    list()->selectArchive(0);
}

// The file manager hears of the new pictures although no event loop runs any more after the end.
void tst_titlerwindow_closing::verifyReports()
{
    const auto reported = [this] {
        QSet<QString> stems;
        for (QByteArray arguments : mSiblings.argumentsOf(FILE_MANAGER, UPDATE_TITLER_STATUS)) {
            FileManagerDefine::tagTitleChangeStatusParam notice;
            FileManagerControllerParams::deserialize_updateTitlerStatus_param(notice, arguments.data(),
                                                                              long(arguments.size()));
            if (notice.changeType == FileManagerDefine::TITLE_PICTURES_CHANGED)
                stems.insert(QFileInfo(QString::fromStdWString(notice.path)).completeBaseName());
        }
        return stems.contains(QSet<QString>(mChanged.cbegin(), mChanged.cend()));
    };
    const QDeadlineTimer limit(PATIENCE_MS);
    while (!reported() && !limit.hasExpired())
        QThread::msleep(5);
    QVERIFY(reported());
}

void tst_titlerwindow_closing::verifyAnswer(Ending ending)
{
    QVERIFY(!mWindow->isVisible());
    if (ending != AnswerOfCreation) {
        QCOMPARE(mAnswers.calls, 0);
        return;
    }
    QCOMPARE(mAnswers.calls, 1);
    QCOMPARE(mAnswers.paths, (QStringList{mMade.at(1), mMade.at(0)})); // the order of the folder
}

void tst_titlerwindow_closing::verifyDisk()
{
    QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30))); // the versions before are kept until then
    QCOMPARE(LibraryFixture::order(mFolder), mOrder);
    QSet<QString> known{".order.xml"};
    for (const QString& stem : std::as_const(mOrder)) {
        QCOMPARE(textsOnDisk(stem), mTexts.value(stem));
        known.insert(stem + ".xml");
        for (const char* picture : PICTURES) {
            known.insert(stem + picture);
            if (mChanged.contains(stem))
                QVERIFY2(!QImage(mFolder + '/' + stem + picture).isNull(), picture);
        }
    }
    const QStringList files = QDir(mFolder).entryList(QDir::Files | QDir::Hidden);
    for (const QString& file : files)
        QVERIFY2(known.contains(file), qPrintable(file));
    if (mDraggedFrom.isNull())
        return;
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(mFolder + "/a.xml", &archive));
    const TText* text = archive.text().front();
    const QPointF saved(text->getXValue(), text->getYValue());
    QVERIFY((saved - mDraggedFrom).manhattanLength() < 0.1);
}

void tst_titlerwindow_closing::enter(State state)
{
    switch (state) {
    case Idle:
        break;
    case TextTyped:
        typeText(1, QStringLiteral(" 快讯"));
        mTexts["a"][1] += QStringLiteral(" 快讯");
        mChanged = QStringList{"a"};
        break;
    case TextSelected:
        typeText(1, QStringLiteral("!"));
        mWindow->hideSoftWareWithDeleteEmptyItems();
        scene()->findTextItem(1)->setSelected(true);
        mTexts["a"][1] += QStringLiteral("!");
        mChanged = QStringList{"a"};
        break;
    case NewTextTyped:
        mWindow->slotNewTextButtonClicked();
        typeText(2, QStringLiteral("second"));
        mTexts["a"][2] = scene()->findTextItem(2)->toPlainText();
        mChanged = QStringList{"a"};
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
            const QString stem = mOrder.at(row);
            typeText(1, QStringLiteral("+"));
            mTexts[stem][1] += QStringLiteral("+");
            mChanged.append(stem);
        }
        break;
    case PasteDeletedAtOnce:
        choose(ArchiveAction::ACTION_PASTE, 0);
        QCOMPARE(list()->count(), 6);
        choose(ArchiveAction::ACTION_DELETE, 1);
        QCOMPARE(stems(), mOrder);
        break;
    case DeletedAndUndone:
        choose(ArchiveAction::ACTION_DELETE, 2);
        QCOMPARE(list()->count(), 4);
        undoAction()->trigger();
        QCOMPARE(stems(), mOrder);
        break;
    }
}

void tst_titlerwindow_closing::end(Ending ending)
{
    switch (ending) {
    case Close:
        EditContextController::getInstance()->resultCallBack(nullptr);
        mWindow->closeTitlerWindow();
        break;
    case CloseAfterQuestion:
        mWindow->closeTitlerWindow();
        QVERIFY(mWindow->isVisible());
        mWindow->continueCloseTitler({1, MessageDefine::CLOSE_CANCEL, MessageDef::MESSAGE_CONFIRM_CLOSE});
        break;
    case AnswerOfCreation:
        mWindow->closeTitlerWindow();
        break;
    case PowerOff:
        TitlerPowerController::getInstance()->powerOff();
        break;
    case Signal:
        mWindow->endProcess();
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
    const QPoint point = widget->mapTo(mWindow.get(), place);
    auto touch = QTest::touchEvent(mWindow.get(), mDevice);
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
    auto* view = mWindow->findChild<GraphicsView*>();
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
    mDraggedFrom = before; // where an object returns that nobody has let go of
}

// To below the next title; the finger stays down.
void tst_titlerwindow_closing::carryTitle()
{
    mWindow->editAndDoneButtonClicked();
    finger(QEventPoint::Pressed, list(), QPoint(HANDLE_X, 65));
    QTRY_VERIFY(list()->getMoveState());
    for (int step = 1; step <= 8; ++step)
        finger(QEventPoint::Updated, list(), QPoint(HANDLE_X, 65 + ROW * step / 8));
    mOrder.move(0, 1);
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
    for (QAction* action : mWindow->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly))
        if (action->text().startsWith("Undo"))
            return action;
    return nullptr;
}

Texts tst_titlerwindow_closing::textsOnDisk(const QString& stem) const
{
    Archive archive;
    if (!ArchiveController().getOneArchive(mFolder + '/' + stem + ".xml", &archive))
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

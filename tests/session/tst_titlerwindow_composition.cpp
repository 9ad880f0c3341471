// A composition of an input method that is under way when the operator leaves the text for something else.
#include "app/APPEventFilter.h"
#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "tests/app/Siblings.h"
#include "tests/fakes/FakeInputMethod.h"
#include "tests/library/LibraryFixture.h"
#include "tests/support/Patience.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QApplication>
#include <QInputMethodEvent>
#include <QMetaEnum>
#include <QPointer>
#include <QTest>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>

class tst_titlerwindow_composition : public QObject
{
    Q_OBJECT

public:
    enum Road { MoveMode, OtherTitle, NewText, Close, Ending };
    Q_ENUM(Road)

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void isCommitted_data();
    void isCommitted();

private:
    void take(Road road);
    ArchiveList* list() const { return mWindow->findChild<ArchiveList*>(); }
    CanvasScene* scene() const { return mWindow->findChild<CanvasScene*>(); }

    LibraryFixture mFixture;
    Siblings mSiblings;
    // The first context of a program is the one that the window works with.
    FakeInputMethod* mMethod = nullptr;
    std::unique_ptr<KSInputContext> mContext;
    std::unique_ptr<TitlerWindow> mWindow;
    QString mFolder;
};

void tst_titlerwindow_composition::initTestCase()
{
    QVERIFY(mSiblings.listenOnFreePorts());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    QCOMPARE(KSInputContext::instance(), nullptr);
}

void tst_titlerwindow_composition::init()
{
    auto method = std::make_unique<FakeInputMethod>();
    mMethod = method.get();
    mContext = std::make_unique<KSInputContext>(std::move(method));
    APPEventFilter::instance();
    mWindow = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = mWindow.get();
    mWindow->setRealClose(false);
    mContext->setKeyBoardController(nullptr); // a keyboard with keys
    mFolder = mFixture.makeFolder(QStringLiteral("composition"));
    LibraryFixture::fillFolder(mFolder, {"a", "b"});
    mWindow->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, mFolder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowActive(mWindow.get(), PATIENCE_MS));
    QTRY_VERIFY(list()->archiveItem(1) && list()->archiveItem(1)->hasChildWidgets());
}

void tst_titlerwindow_composition::cleanup()
{
    if (mWindow->isVisible())
        mWindow->closeTitlerMainWindow();
    mWindow.reset();
    pMainWindow = nullptr;
    mContext.reset();
    APPEventFilter::release();
}

void tst_titlerwindow_composition::isCommitted_data()
{
    QTest::addColumn<Road>("road");
    const QMetaEnum roads = QMetaEnum::fromType<Road>();
    for (int i = 0; i < roads.keyCount(); ++i)
        QTest::newRow(roads.key(i)) << Road(roads.value(i));
}

void tst_titlerwindow_composition::take(Road road)
{
    switch (road) {
    case MoveMode:
        for (KSPushbutton* button : mWindow->findChildren<KSPushbutton*>())
            if (button->text() == TitlerWindow::tr("Move"))
                button->click();
        QVERIFY(mWindow->archiveListIsMoveMode());
        break;
    case OtherTitle:
        Q_EMIT list()->widgetItemReleased(list()->archiveItem(1), QPoint(), list());
        QCOMPARE(list()->getItemIndex(list()->getSelectedArchive()), 1);
        break;
    case NewText:
        mWindow->slotNewTextButtonClicked();
        break;
    case Close:
        mWindow->closeTitlerWindow();
        break;
    case Ending:
        mWindow->endProcess();
        break;
    }
}

void tst_titlerwindow_composition::isCommitted()
{
    QFETCH(Road, road);
    auto* view = mWindow->findChild<GraphicsView*>();
    view->setFocus();
    mContext->setFocusObject(view);
    GraphicsText* item = scene()->findTextItem(1);
    item->initNewTextSelectAll();
    QTextCursor cursor = item->textCursor();
    cursor.movePosition(QTextCursor::End);
    item->setTextCursor(cursor);
    QInputMethodEvent composing(QStringLiteral("kuai"), {});
    QCoreApplication::sendEvent(view, &composing);
    QCOMPARE(cursor.block().layout()->preeditAreaText(), QStringLiteral("kuai"));
    QCOMPARE(item->toPlainText(), QStringLiteral("a"));
    mMethod->composed = QString::fromUtf8("快");
    mMethod->commits = 0;

    const QPointer<GraphicsText> alive = item;
    take(road);
    QVERIFY(mMethod->commits > 0);
    QVERIFY(mMethod->composed.isEmpty());
    if (alive && scene()->findTextItem(1) == item) {
        QCOMPARE(item->toPlainText(), QString::fromUtf8("a快"));
        QVERIFY(item->document()->firstBlock().layout()->preeditAreaText().isEmpty());
    }
    if (mWindow->isVisible())
        mWindow->closeTitlerWindow();
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(mFolder + "/a.xml", &archive));
    QCOMPARE(QString::fromStdString(archive.text().front()->getText()), QString::fromUtf8("a快"));
}

int main(int argc, char** argv)
{
    QApplication application(argc, argv);
    application.setObjectName(QStringLiteral("Titler"));
    QApplication::setQuitOnLastWindowClosed(false);
    tst_titlerwindow_composition test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow_composition.moc"

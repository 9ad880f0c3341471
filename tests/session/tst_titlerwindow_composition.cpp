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
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    CanvasScene* scene() const { return m_window->findChild<CanvasScene*>(); }

    LibraryFixture m_fixture;
    Siblings m_siblings;
    // The first context of a program is the one that the window works with.
    FakeInputMethod* m_method = nullptr;
    std::unique_ptr<KSInputContext> m_context;
    std::unique_ptr<TitlerWindow> m_window;
    QString m_folder;
};

void tst_titlerwindow_composition::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    QCOMPARE(KSInputContext::instance(), nullptr);
}

void tst_titlerwindow_composition::init()
{
    auto method = std::make_unique<FakeInputMethod>();
    m_method = method.get();
    m_context = std::make_unique<KSInputContext>(std::move(method));
    APPEventFilter::instance();
    m_window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = m_window.get();
    m_window->setRealClose(false);
    m_context->setKeyBoardController(nullptr); // a keyboard with keys
    m_folder = m_fixture.makeFolder(QStringLiteral("composition"));
    LibraryFixture::fillFolder(m_folder, {"a", "b"});
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, m_folder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    QTRY_VERIFY(list()->archiveItem(1) && list()->archiveItem(1)->hasChildWidgets());
}

void tst_titlerwindow_composition::cleanup()
{
    if (m_window->isVisible())
        m_window->closeTitlerMainWindow();
    m_window.reset();
    pMainWindow = nullptr;
    m_context.reset();
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
        for (KSPushbutton* button : m_window->findChildren<KSPushbutton*>())
            if (button->text() == TitlerWindow::tr("Move"))
                button->click();
        QVERIFY(m_window->archiveListIsMoveMode());
        break;
    case OtherTitle:
        Q_EMIT list()->widgetItemReleased(list()->archiveItem(1), QPoint(), list());
        QCOMPARE(list()->getItemIndex(list()->getSelectedArchive()), 1);
        break;
    case NewText:
        m_window->slotNewTextButtonClicked();
        break;
    case Close:
        m_window->closeTitlerWindow();
        break;
    case Ending:
        m_window->endProcess();
        break;
    }
}

void tst_titlerwindow_composition::isCommitted()
{
    QFETCH(Road, road);
    auto* view = m_window->findChild<GraphicsView*>();
    view->setFocus();
    m_context->setFocusObject(view);
    GraphicsText* item = scene()->findTextItem(1);
    item->initNewTextSelectAll();
    QTextCursor cursor = item->textCursor();
    cursor.movePosition(QTextCursor::End);
    item->setTextCursor(cursor);
    QInputMethodEvent composing(QStringLiteral("kuai"), {});
    QCoreApplication::sendEvent(view, &composing);
    QCOMPARE(cursor.block().layout()->preeditAreaText(), QStringLiteral("kuai"));
    QCOMPARE(item->toPlainText(), QStringLiteral("a"));
    m_method->composed = QString::fromUtf8("快");
    m_method->commits = 0;

    const QPointer<GraphicsText> alive = item;
    take(road);
    QVERIFY(m_method->commits > 0);
    QVERIFY(m_method->composed.isEmpty());
    if (alive && scene()->findTextItem(1) == item) {
        QCOMPARE(item->toPlainText(), QString::fromUtf8("a快"));
        QVERIFY(item->document()->firstBlock().layout()->preeditAreaText().isEmpty());
    }
    if (m_window->isVisible())
        m_window->closeTitlerWindow();
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(m_folder + "/a.xml", &archive));
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

// The balloon menu: placed, tapped, closed.
#include "tests/support/Patience.h"
#include "tests/touchui/TouchFixture.h"
#include "touchui/KSMenu.h"
#include "touchui/TouchEventButton.h"

#include <QPushButton>
#include <QSignalSpy>
#include <QTest>
#include <QTimer>

class tst_ksmenu : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void tapChoosesAndCloses();
    void mouseChoosesTheSameWay();
    void disabledActionKeepsItOpen();
    void slidingOffChoosesNothing();
    void secondFingerChoosesNothing();
    void cancelChoosesNothing();
    void otherButtonsChooseNothing();
    void pressOutsideClosesAndPressesNothing_data();
    void pressOutsideClosesAndPressesNothing();
    void pressOutsideClosesItBeforeOthersTakeIt();
    void refusedFingerOutsideLeavesItOpen();
    void fingerThatOpenedItIsLiftedForItsWidget();
    void closesByItsTimer();
    void noTimeNoTimer();
    void closeTellsOnlyWhenVisible();
    void keys();
    void placedBesideTheAnchor();
    void backgroundAndRows();
    void hiddenActionsHaveNoRow();
    void pressedRowIsMarked();
    void emptyMenu();

private:
    QPoint row(int index) const { return m_menu->getMenuItemRect(index).center(); }
    void open(const QPoint& anchor = QPoint(300, 100))
    {
        m_menu->popup(m_window->mapToGlobal(anchor));
        QVERIFY(QTest::qWaitForWindowExposed(m_menu, PATIENCE_MS));
    }

    std::unique_ptr<TouchFixture> m_touch;
    std::unique_ptr<QWidget> m_window;
    TouchEventButton* m_button = nullptr;
    KSMenu* m_menu = nullptr;
    QList<QAction*> m_actions;
};

void tst_ksmenu::init()
{
    Q_INIT_RESOURCE(UILibrary);
    m_touch = std::make_unique<TouchFixture>();
    m_window = std::make_unique<QWidget>();
    m_window->setGeometry(0, 0, 800, 600);
    m_button = new TouchEventButton(QStringLiteral("under"), m_window.get());
    m_button->setGeometry(10, 500, 200, 80);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
    KSMenu::setMainWindow(m_window.get());
    m_menu = new KSMenu(m_window.get());
    m_actions = {m_menu->addAction(QStringLiteral("Create New")), m_menu->addAction(QStringLiteral("Copy")),
                 m_menu->addAction(QStringLiteral("Paste"))};
    m_actions[1]->setEnabled(false);
}

void tst_ksmenu::cleanup()
{
    KSMenu::setMainWindow(nullptr);
    m_window.reset();
    m_touch.reset();
}

void tst_ksmenu::tapChoosesAndCloses()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    QSignalSpy closing(m_menu, &KSMenu::signalMenuAboutToClose);
    open();
    m_touch->press(m_menu, row(2));
    QCOMPARE(m_menu->currentItem(), 2);
    QVERIFY(m_touch->isLocked());
    m_touch->lift(m_menu, row(2));
    QVERIFY(!m_menu->isVisible());
    QVERIFY(!m_touch->isLocked());
    QCOMPARE(triggered.count(), 1);
    QCOMPARE(triggered.at(0).at(0).value<QAction*>(), m_actions[2]);
    QCOMPARE(closing.count(), 1);
}

void tst_ksmenu::mouseChoosesTheSameWay()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    QTest::mousePress(m_menu, Qt::LeftButton, {}, row(2));
    QTest::mouseMove(m_menu, row(0));
    QCOMPARE(m_menu->currentItem(), 0);
    QTest::mouseRelease(m_menu, Qt::LeftButton, {}, row(0));
    QVERIFY(!m_menu->isVisible());
    QCOMPARE(triggered.count(), 1);
    QCOMPARE(triggered.at(0).at(0).value<QAction*>(), m_actions[0]);
}

void tst_ksmenu::disabledActionKeepsItOpen()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    m_touch->tap(m_menu, row(1));
    QVERIFY(m_menu->isVisible());
    QCOMPARE(triggered.count(), 0);
    QTest::mouseClick(m_menu, Qt::LeftButton, {}, row(1));
    QVERIFY(m_menu->isVisible());
    QCOMPARE(triggered.count(), 0);
}

void tst_ksmenu::slidingOffChoosesNothing()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    m_touch->press(m_menu, row(0));
    m_touch->move(m_menu, row(2));
    QCOMPARE(m_menu->currentItem(), 2);
    m_touch->move(m_menu, QPoint(-50, 20));
    QCOMPARE(m_menu->currentItem(), -1);
    m_touch->lift(m_menu, QPoint(-50, 20));
    QCOMPARE(triggered.count(), 0);
    QVERIFY(m_menu->isVisible());
    QVERIFY(!m_touch->isLocked());
}

void tst_ksmenu::secondFingerChoosesNothing()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    auto touch = QTest::touchEvent(m_menu, m_touch->device(), false);
    touch.press(0, row(0), m_menu).commit();
    touch.stationary(0).press(1, row(2), m_menu).commit();
    QCOMPARE(m_menu->currentItem(), 0);
    touch.stationary(0).release(1, row(2), m_menu).commit();
    QCOMPARE(triggered.count(), 0);
    touch.release(0, row(0), m_menu).commit();
    QCOMPARE(triggered.count(), 1);
    QCOMPARE(triggered.at(0).at(0).value<QAction*>(), m_actions[0]);
}

void tst_ksmenu::cancelChoosesNothing()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    m_touch->press(m_menu, row(0));
    m_touch->cancel(m_menu);
    QCOMPARE(m_menu->currentItem(), -1);
    QVERIFY(!m_touch->isLocked());
    m_touch->lift(m_menu, row(0));
    QCOMPARE(triggered.count(), 0);
    QVERIFY(m_menu->isVisible());
}

void tst_ksmenu::otherButtonsChooseNothing()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    QTest::mouseClick(m_menu, Qt::RightButton, {}, row(0));
    QVERIFY(m_menu->isVisible());
    QCOMPARE(triggered.count(), 0);
}

void tst_ksmenu::pressOutsideClosesAndPressesNothing_data()
{
    QTest::addColumn<bool>("finger");
    QTest::newRow("finger") << true;
    QTest::newRow("mouse") << false;
}

void tst_ksmenu::pressOutsideClosesAndPressesNothing()
{
    QFETCH(bool, finger);
    const auto tapButton = [this, finger] {
        if (finger) {
            m_touch->press(m_button, QPoint(20, 20));
            m_touch->move(m_button, QPoint(25, 20));
            m_touch->lift(m_button, QPoint(25, 20));
        } else {
            QTest::mouseClick(m_button, Qt::LeftButton, {}, QPoint(20, 20));
        }
    };
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QSignalSpy pressed(m_button, &QAbstractButton::pressed);
    QSignalSpy closing(m_menu, &KSMenu::signalMenuAboutToClose);
    open();
    tapButton();
    QVERIFY(!m_menu->isVisible());
    QCOMPARE(closing.count(), 1);
    QCOMPARE(pressed.count(), 0);
    QVERIFY(!m_touch->isLocked());
    tapButton(); // the next one presses again
    QCOMPARE(clicked.count(), 1);
    QVERIFY(!m_touch->isLocked());
}

// As the window does while the slider of the edge is open.
void tst_ksmenu::pressOutsideClosesItBeforeOthersTakeIt()
{
    class Eater : public QObject
    {
    public:
        bool eventFilter(QObject*, QEvent* event) override
        {
            const bool touch = event->type() == QEvent::TouchBegin || event->type() == QEvent::TouchEnd;
            eaten += touch ? 1 : 0;
            return touch;
        }
        int eaten = 0;
    };
    Eater eater;
    m_touch->filter->registerEventFilter(&eater);
    open();
    m_touch->tap(m_button, QPoint(20, 20));
    QVERIFY(!m_menu->isVisible());
    QCOMPARE(eater.eaten, 0);
    m_touch->tap(m_button, QPoint(20, 20));
    QCOMPARE(eater.eaten, 2);
}

// A touch that the locks refuse, here a second finger's, reaches nobody.
void tst_ksmenu::refusedFingerOutsideLeavesItOpen()
{
    QPushButton other(m_window.get());
    other.setAttribute(Qt::WA_AcceptTouchEvents);
    other.setGeometry(300, 500, 200, 80);
    other.show();
    m_touch->press(m_button, QPoint(20, 20));
    open(QPoint(30, 300));
    m_touch->press(&other, QPoint(20, 20), 1);
    QVERIFY(m_menu->isVisible());
    m_touch->lift(&other, QPoint(20, 20), 1);
    m_touch->lift(m_button, QPoint(20, 20));
    QVERIFY(m_menu->isVisible());
    // Alone it is let in, holds its lock as any touch, and closes the menu.
    m_touch->press(&other, QPoint(20, 20), 1);
    QVERIFY(!m_menu->isVisible());
    QVERIFY(m_touch->isLocked());
    m_touch->lift(&other, QPoint(20, 20), 1);
    QVERIFY(!m_touch->isLocked());
}

void tst_ksmenu::fingerThatOpenedItIsLiftedForItsWidget()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    m_touch->press(m_button, QPoint(20, 20));
    open(QPoint(30, 300));
    m_touch->lift(m_button, QPoint(20, 20));
    QCOMPARE(clicked.count(), 1);
    QVERIFY(!m_touch->isLocked());
    QVERIFY(m_menu->isVisible());
    QCOMPARE(triggered.count(), 0);
}

void tst_ksmenu::closesByItsTimer()
{
    QSignalSpy closing(m_menu, &KSMenu::signalMenuAboutToClose);
    m_menu->setAutoCloseTime(30);
    open();
    QTRY_VERIFY(!m_menu->isVisible());
    QCOMPARE(closing.count(), 1);
}

void tst_ksmenu::noTimeNoTimer()
{
    open();
    m_menu->startAutoCloseTimer();
    m_menu->restartAutoCloseTimer();
    QVERIFY(m_menu->findChildren<QTimer*>(QString(), Qt::FindDirectChildrenOnly).isEmpty());
    m_menu->setAutoCloseTime(100000);
    m_menu->startAutoCloseTimer();
    m_menu->restartAutoCloseTimer();
    const QList<QTimer*> timers = m_menu->findChildren<QTimer*>(QString(), Qt::FindDirectChildrenOnly);
    QCOMPARE(timers.size(), 1);
    QVERIFY(timers.constFirst()->isActive());
    m_menu->hide();
    QVERIFY(!timers.constFirst()->isActive());
}

void tst_ksmenu::closeTellsOnlyWhenVisible()
{
    QSignalSpy closing(m_menu, &KSMenu::signalMenuAboutToClose);
    m_menu->close();
    QCOMPARE(closing.count(), 0);
    open();
    m_menu->close();
    QCOMPARE(closing.count(), 1);
}

void tst_ksmenu::keys()
{
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    QTest::keyClick(m_menu, Qt::Key_Down);
    QCOMPARE(m_menu->currentItem(), 0);
    QTest::keyClick(m_menu, Qt::Key_Up);
    QCOMPARE(m_menu->currentItem(), 2);
    QTest::keyClick(m_menu, Qt::Key_Return);
    QCOMPARE(triggered.count(), 1);
    QVERIFY(!m_menu->isVisible());
    open();
    QTest::keyClick(m_menu, Qt::Key_Escape);
    QVERIFY(!m_menu->isVisible());
    QCOMPARE(triggered.count(), 1);
}

void tst_ksmenu::placedBesideTheAnchor()
{
    const QPoint anchor(300, 260);
    m_menu->setBalloonAlignment(MenuPlacement::Below);
    open(anchor);
    QCOMPARE(m_menu->geometry().top(), m_window->mapToGlobal(anchor).y());
    QVERIFY(m_menu->geometry().left() < m_window->mapToGlobal(anchor).x());
    QCOMPARE(m_menu->getMenuPointPoints().value(0), QPoint(m_menu->width() / 2, 0));
    m_menu->close();
    m_menu->setBalloonAlignment(MenuPlacement::Above);
    open(anchor);
    QCOMPARE(m_menu->geometry().bottom() + 1, m_window->mapToGlobal(anchor).y() + 45);
    QCOMPARE(m_menu->geometry().left(), m_window->mapToGlobal(anchor).x());
    QCOMPARE(m_menu->mapToGlobal(m_menu->getMenuPointPoints().value(0)), m_window->mapToGlobal(anchor));
    m_menu->close();
    open(QPoint(300, 590));
    QCOMPARE(m_menu->geometry().bottom() + 1, m_window->mapToGlobal(QPoint(0, 600)).y() - 13);
    m_menu->close();
    m_menu->setBalloonAlignment(0);
    open(QPoint(790, 400));
    QCOMPARE(m_menu->geometry().bottom() + 1, m_window->mapToGlobal(QPoint(0, 400)).y() - 9);
    QCOMPARE(m_menu->geometry().right() + 1, m_window->mapToGlobal(QPoint(800, 0)).x());
}

void tst_ksmenu::backgroundAndRows()
{
    open();
    QCOMPARE(m_menu->getMenuBackgroundRect(), m_menu->rect().adjusted(0, 12, 0, 0));
    QCOMPARE(m_menu->getMenuItemHeight(), m_menu->height() / 3);
    for (int i = 0; i < 3; ++i) {
        QCOMPARE(m_menu->cursorItem(row(i)), i);
        QVERIFY(m_menu->getMenuItemRect(i).height() >= 60);
    }
    QCOMPARE(m_menu->cursorItem(QPoint(m_menu->width() / 2, 3)), -1);
    m_menu->close();
    m_menu->setBalloonAlignment(MenuPlacement::Above);
    open();
    QCOMPARE(m_menu->getMenuBackgroundRect(), m_menu->rect().adjusted(12, 0, 0, 0));
}

void tst_ksmenu::hiddenActionsHaveNoRow()
{
    m_actions[0]->setVisible(false);
    m_menu->addSeparator();
    QSignalSpy triggered(m_menu, &QMenu::triggered);
    open();
    QVERIFY(m_menu->getMenuItemRect(2).isNull());
    m_touch->tap(m_menu, row(1));
    QCOMPARE(triggered.at(0).at(0).value<QAction*>(), m_actions[2]);
}

void tst_ksmenu::pressedRowIsMarked()
{
    open();
    const QImage rest = m_menu->grab().toImage();
    m_touch->press(m_menu, row(0));
    const QImage pressed = m_menu->grab().toImage();
    QVERIFY(rest.copy(m_menu->getMenuItemRect(0)) != pressed.copy(m_menu->getMenuItemRect(0)));
    QCOMPARE(rest.copy(m_menu->getMenuItemRect(2)), pressed.copy(m_menu->getMenuItemRect(2)));
    m_touch->move(m_menu, row(1)); // disabled: no mark
    QCOMPARE(m_menu->grab().toImage(), rest);
    m_touch->lift(m_menu, row(1));
}

void tst_ksmenu::emptyMenu()
{
    KSMenu menu(m_window.get());
    menu.popup(m_window->mapToGlobal(QPoint(100, 100)));
    QCOMPARE(menu.getMenuItemHeight(), menu.height());
    QCOMPARE(menu.cursorItem(menu.rect().center()), -1);
    if (menu.isVisible()) {
        m_touch->tap(&menu, menu.rect().center());
        QVERIFY(!m_touch->isLocked());
    }
}

QTEST_MAIN(tst_ksmenu)
#include "tst_ksmenu.moc"

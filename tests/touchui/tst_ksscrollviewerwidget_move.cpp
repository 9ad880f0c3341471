// Rows lifted and dropped by a finger: places, edge scrolling, and what may happen to the list meanwhile.
#include "ScrollViewerTest.h"

#include <QSignalSpy>

using Names = QStringList;

class tst_ksscrollviewerwidget_move : public ScrollViewerTest
{
    Q_OBJECT
private Q_SLOTS:
    void liftAndDrop();
    void dropAtTheEnd();
    void dropAtTheSamePlace();
    void fingerThatMovedBeforeTheLift();
    void mouseThatMovedBeforeTheLift();
    void dropAtEdgeScrollsDown();
    void edgeScrollingFasterFarOut();
    void edgeScrollingStopsInside();
    void cloneJumpsAside();
    void rowWithoutCloneFloatsItself();
    void handleReleasedEarlyIsATap();
    void pressBesideTheHandleLiftsNothing();
    void startMoveOfTheRowLifts();
    void switchingOffDropsTheRow();
    void othersAreDeafWhileDragging();
    void addingWhileDraggingKeepsThePlace();
    void removingTheLiftedRow();
    void clearingWhileDragging();
    void deletedWhileDragging();
    void mouseLiftsAndDrops();
};

void tst_ksscrollviewerwidget_move::liftAndDrop()
{
    lift(1);
    const KSBaseItemWidget* clone = m->m_list->getMoveItem();
    QVERIFY(clone && clone->isPopup() && clone->isVisible());
    QCOMPARE(clone->parentWidget(), &m->m_window);
    QCOMPARE(QWidget::mouseGrabber(), m->m_list->viewport());
    const int x = clone->x();
    for (int y = 154; y <= 360; y += 10)
        m->move(70, y);
    QCOMPARE(clone->x(), x); // it moves up and down only
    QCOMPARE(m->value(), 0); // and the list stays
    m->release(70, 360);
    QCOMPARE(m->takeLog().filter("dropped").size(), 1);
    QCOMPARE(m->order().mid(0, 6), (Names{"0", "2", "3", "1", "4", "5"}));
    QVERIFY(!m->m_list->isDragging());
    QVERIFY(!m->m_list->getMoveItem());
    QVERIFY(!QWidget::mouseGrabber());
    QVERIFY(m->m_list->getWidgetItem(3)->isVisible());
    QVERIFY(!m->m_list->getWidgetItem(3)->isPopup());
    QVERIFY(m->m_list->getWidgetItem(3)->hasDragFlag());
    QCOMPARE(m->m_list->getWidgetItem(3)->y(), 3 * ScrollViewerFixture::ROW);
    QVERIFY(clone->isHidden());
    QCOMPARE(m->clock.running(), 0);
    m->takeLog();
    m->tap(100, 150);
    QCOMPARE(m->takeLog().first(), QStringLiteral("pressed 2"));
}

void tst_ksscrollviewerwidget_move::dropAtTheEnd()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(4);
    m->m_list->slotItemsCanDrag(true);
    m->press(50, 50);
    m->clock.advance(50);
    m->move(50, 100);
    m->move(50, 440);
    m->release(50, 440);
    QCOMPARE(m->order(), (Names{"1", "2", "3", "0"}));
    // And back to the start.
    m->press(50, 3 * ScrollViewerFixture::ROW + 50);
    m->clock.advance(50);
    m->move(50, 200);
    m->move(50, 20);
    m->release(50, 20);
    QCOMPARE(m->order(), (Names{"0", "1", "2", "3"}));
}

void tst_ksscrollviewerwidget_move::dropAtTheSamePlace()
{
    lift(2);
    m->move(50, 270);
    m->release(50, 270);
    QCOMPARE(m->order().mid(0, 4), (Names{"0", "1", "2", "3"}));
    QCOMPARE(m->takeLog().filter("dropped").size(), 1);
}

// On a busy machine all moves of a quick finger may be handled before the row is lifted.
void tst_ksscrollviewerwidget_move::fingerThatMovedBeforeTheLift()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(20);
    m->m_list->slotItemsCanDrag(true);
    m->press(50, 50);
    m->move(50, 150);
    m->move(50, 364);
    m->clock.advance(50);
    QVERIFY(m->m_list->isDragging());
    m->release(50, 364);
    QCOMPARE(m->order().mid(0, 5), (Names{"1", "2", "3", "0", "4"}));

    // A finger that is beyond the edge by then scrolls the list.
    m->press(50, 50);
    m->move(50, 150);
    m->move(50, 480);
    m->clock.advance(50 + 40 * 200);
    QCOMPARE(m->value(), m->maximum());
    m->release(50, 480);
    QCOMPARE(m->order().constLast(), QStringLiteral("1"));
}

void tst_ksscrollviewerwidget_move::mouseThatMovedBeforeTheLift()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(4);
    m->m_list->slotItemsCanDrag(true);
    QWidget* row = m->m_list->getWidgetItem(0);
    QTest::mousePress(row, Qt::LeftButton, Qt::NoModifier, QPoint(12, 50));
    QTest::mouseMove(row, QPoint(12, 53));
    QTest::mouseMove(row, QPoint(12, 260));
    m->clock.advance(50);
    QVERIFY(m->m_list->isDragging());
    QTest::mouseRelease(m->m_list->viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(50, 260));
    QCOMPARE(m->order(), (Names{"1", "2", "0", "3"}));
}

void tst_ksscrollviewerwidget_move::dropAtEdgeScrollsDown()
{
    lift(2);
    m->move(50, 300);
    m->move(50, 470); // the clone hangs over the lower edge
    m->clock.advance(40 * 200);
    QCOMPARE(m->value(), m->maximum());
    m->move(50, 480);
    m->release(50, 480);
    QCOMPARE(m->order().constLast(), QStringLiteral("2"));
    QCOMPARE(m->value(), m->maximum());
    QCOMPARE(m->clock.running(), 0);
    m->takeLog();
    // Moves the item up again.
    m->press(50, 450);
    m->clock.advance(50);
    QCOMPARE(m->takeLog(), Names{"lifted 2"});
    m->move(50, 300);
    m->move(50, -40);
    m->clock.advance(40 * 200);
    QCOMPARE(m->value(), 0);
    m->release(50, -40);
    QCOMPARE(m->order().constFirst(), QStringLiteral("2"));
    QCOMPARE(m->order().size(), 20);
}

void tst_ksscrollviewerwidget_move::edgeScrollingFasterFarOut()
{
    lift(2);
    const int height = ScrollViewerFixture::HEIGHT;
    const auto hang = [&](int overhang) { // by so much
        const KSBaseItemWidget* clone = m->m_list->getMoveItem();
        const int bottom = clone->mapTo(&m->m_window, QPoint(0, clone->height())).y() - m->m_list->y();
        static int finger = 258;
        finger += overhang - (bottom - height);
        m->move(50, finger);
    };
    m->move(50, 258);
    hang(10);
    m->clock.advance(40);
    QCOMPARE(m->value(), 10);
    hang(30);
    m->clock.advance(40);
    QCOMPARE(m->value(), 20);
    hang(31);
    m->clock.advance(40);
    QCOMPARE(m->value(), 50);
    hang(9);
    m->clock.advance(400);
    QCOMPARE(m->value(), 50);
    m->release(50, 400);
}

void tst_ksscrollviewerwidget_move::edgeScrollingStopsInside()
{
    lift(2);
    m->move(50, 470);
    m->clock.advance(400);
    const int value = m->value();
    QVERIFY(value > 0);
    m->move(50, 250);
    m->clock.advance(400);
    QCOMPARE(m->value(), value);
    m->release(50, 250);
}

void tst_ksscrollviewerwidget_move::cloneJumpsAside()
{
    lift(1);
    // 20 to the left and 20 down of where the row was, for a handle on the left.
    QCOMPARE(m->m_list->getMoveItem()->pos(), QPoint(100 + 38 - 20, 100 + ScrollViewerFixture::ROW + 20));
    m->release(50, 154);
    for (int i = 0; i < m->m_list->count(); ++i)
        m->m_list->getWidgetItem(i)->setDragFlagAlignment(DRAGFLAG_RIGHT);
    m->press(390, 154);
    m->clock.advance(50);
    QCOMPARE(m->m_list->getMoveItem()->pos(), QPoint(100 + 38 + 20, 100 + ScrollViewerFixture::ROW + 20));
    m->release(390, 154);
}

void tst_ksscrollviewerwidget_move::rowWithoutCloneFloatsItself()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(5, false);
    m->m_list->slotItemsCanDrag(true);
    KSBaseItemWidget* row = m->m_list->getWidgetItem(1);
    m->press(50, 154);
    m->clock.advance(50);
    QCOMPARE(m->m_list->getMoveItem(), row);
    QVERIFY(row->isVisible());
    m->move(50, 200);
    m->move(50, 364);
    m->release(50, 364);
    QCOMPARE(m->order(), (Names{"0", "2", "3", "1", "4"}));
    QVERIFY(row->isVisible());
    m->press(50, 50);
    m->clock.advance(50);
    m->release(50, 50);
    QCOMPARE(m->m_list->getWidgetItem(3), row);
}

void tst_ksscrollviewerwidget_move::handleReleasedEarlyIsATap()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_RIGHT);
    m->fill(5);
    m->m_list->slotItemsCanDrag(true);
    m->press(390, 154);
    m->clock.advance(49);
    m->release(390, 154);
    m->clock.advance(100);
    QCOMPARE(m->takeLog(), (Names{"released 1", "clicked 1"}));
    QVERIFY(!m->m_list->isDragging());
}

void tst_ksscrollviewerwidget_move::pressBesideTheHandleLiftsNothing()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(5);
    m->m_list->slotItemsCanDrag(true);
    m->press(38 + 36, 154);
    m->clock.advance(100);
    QVERIFY(!m->m_list->isDragging());
    m->release(38 + 36, 154);
    m->m_list->slotItemsCanDrag(false);
    m->press(50, 154);
    m->clock.advance(100);
    QVERIFY(!m->m_list->isDragging());
    m->release(50, 154);
}

void tst_ksscrollviewerwidget_move::startMoveOfTheRowLifts()
{
    m->fill(5);
    m->press(200, 154);
    m->takeLog();
    KSBaseItemWidget* row = m->m_list->getWidgetItem(1);
    Q_EMIT row->signalStartMove(row);
    QCOMPARE(m->takeLog(), Names{"lifted 1"});
    m->clock.advance(800); // no hold
    m->move(200, 160);
    m->move(200, 364);
    m->release(200, 364);
    QCOMPARE(m->order(), (Names{"0", "2", "3", "1", "4"}));
    QVERIFY(!row->hasDragFlag());
    QVERIFY(!m->takeLog().contains("held 1"));
}

void tst_ksscrollviewerwidget_move::switchingOffDropsTheRow()
{
    lift(1);
    m->move(50, 160);
    m->move(50, 260);
    m->m_list->slotItemsCanDrag(false);
    QVERIFY(!m->m_list->isDragging());
    QCOMPARE(m->m_list->count(), 20);
    for (int i = 0; i < 20; ++i)
        QVERIFY(!m->m_list->getWidgetItem(i)->hasDragFlag());
    QCOMPARE(m->takeLog(), Names{"dropped"});
    m->release(50, 260);
    QCOMPARE(m->takeLog(), Names());
}

void tst_ksscrollviewerwidget_move::othersAreDeafWhileDragging()
{
    lift(1);
    // Past the application's filter, which would refuse it for itself.
    QCoreApplication::instance()->removeEventFilter(&m->m_filter);
    auto other = QTest::touchEvent(&m->m_window, m_other, false);
    other.press(1, QPoint(200, 450), m->m_list).commit();
    other.move(1, QPoint(200, 200), m->m_list).commit();
    other.release(1, QPoint(200, 200), m->m_list).commit();
    QCoreApplication::instance()->installEventFilter(&m->m_filter);
    QCOMPARE(m->takeLog(), Names());
    QVERIFY(m->m_list->isDragging());
    m->release(50, 154);
}

void tst_ksscrollviewerwidget_move::addingWhileDraggingKeepsThePlace()
{
    lift(1);
    m->m_list->addWidgetItem(new Row(QStringLiteral("new")), 0);
    m->m_list->removeWidgetItem(m->m_list->getWidgetItem(19));
    QVERIFY(m->m_list->isDragging());
    m->release(50, 154);
    QCOMPARE(m->m_list->count(), 20);
    QVERIFY(m->order().contains(QStringLiteral("1")));
    QVERIFY(m->order().contains(QStringLiteral("new")));
}

void tst_ksscrollviewerwidget_move::removingTheLiftedRow()
{
    lift(1);
    KSBaseItemWidget* row = m->m_list->getMoveItem();
    QVERIFY(row);
    KSBaseItemWidget* lifted = m->m_list->getSelectedItem();
    m->m_list->removeWidgetItem(lifted);
    QVERIFY(!m->m_list->isDragging());
    QVERIFY(lifted->isHidden());
    QCOMPARE(m->m_list->count(), 19);
    QVERIFY(!QWidget::mouseGrabber());
    m->move(50, 300);
    m->release(50, 300);
    QCOMPARE(m->takeLog(), Names());
    m->m_list->addWidgetItem(lifted, 1);
    QCOMPARE(m->order().mid(0, 3), (Names{"0", "1", "2"}));
    QVERIFY(lifted->isVisible());
}

void tst_ksscrollviewerwidget_move::clearingWhileDragging()
{
    lift(1);
    m->m_list->removeAll();
    QVERIFY(m->m_list->isEmpty());
    QVERIFY(!m->m_list->isDragging());
    m->move(50, 300);
    m->release(50, 300);
    QCOMPARE(m->maximum(), 0);
    QCOMPARE(m->clock.running(), 0);
    m->fill(3);
    m->tap(100, 50);
    QCOMPARE(m->takeLog(), (Names{"pressed 0", "released 0", "clicked 0"}));
}

void tst_ksscrollviewerwidget_move::deletedWhileDragging()
{
    lift(1);
    delete m->m_list->getSelectedItem();
    delete m->m_list->getWidgetItem(0);
    QCOMPARE(m->m_list->count(), 18);
    m->move(50, 200);
    m->clock.advance(100);
    m->release(50, 200);
    QVERIFY(!m->m_list->isDragging());
    QVERIFY(!m->m_list->getMoveItem());
    QCOMPARE(m->m_list->count(), 18);
    QCOMPARE(m->m_list->getWidgetItem(0)->y(), 0);
    QVERIFY(!m->m_filter.isLock(nullptr, LOCKMETHOD_TOUCH));
}

void tst_ksscrollviewerwidget_move::mouseLiftsAndDrops()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(5);
    m->m_list->slotItemsCanDrag(true);
    QWidget* viewport = m->m_list->viewport();
    QTest::mousePress(m->m_list->getWidgetItem(1), Qt::LeftButton, Qt::NoModifier, QPoint(12, 50));
    m->clock.advance(50);
    QVERIFY(m->m_list->isDragging());
    QTest::mouseMove(viewport, QPoint(50, 200));
    QTest::mouseMove(viewport, QPoint(50, 364));
    QTest::mouseRelease(viewport, Qt::LeftButton, Qt::NoModifier, QPoint(50, 364));
    QCOMPARE(m->order(), (Names{"0", "2", "3", "1", "4"}));
}

QTEST_MAIN(tst_ksscrollviewerwidget_move)
#include "tst_ksscrollviewerwidget_move.moc"

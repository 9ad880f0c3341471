// Rows lifted and dropped by a finger: places, edge scrolling, and what may happen to the list meanwhile.
#include "ScrollViewerTest.h"

#include <QSignalSpy>

using Names = QStringList;

class TestScrollViewerMove : public ScrollViewerTest
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

void TestScrollViewerMove::liftAndDrop()
{
    lift(1);
    const KSBaseItemWidget* clone = m->mList->getMoveItem();
    QVERIFY(clone && clone->isPopup() && clone->isVisible());
    QCOMPARE(clone->parentWidget(), &m->mWindow);
    QCOMPARE(QWidget::mouseGrabber(), m->mList->viewport());
    const int x = clone->x();
    for (int y = 154; y <= 360; y += 10)
        m->move(70, y);
    QCOMPARE(clone->x(), x); // it moves up and down only
    QCOMPARE(m->value(), 0); // and the list stays
    m->release(70, 360);
    QCOMPARE(m->takeLog().filter("dropped").size(), 1);
    QCOMPARE(m->order().mid(0, 6), (Names{"0", "2", "3", "1", "4", "5"}));
    QVERIFY(!m->mList->isDragging());
    QVERIFY(!m->mList->getMoveItem());
    QVERIFY(!QWidget::mouseGrabber());
    QVERIFY(m->mList->getWidgetItem(3)->isVisible());
    QVERIFY(!m->mList->getWidgetItem(3)->isPopup());
    QVERIFY(m->mList->getWidgetItem(3)->hasDragFlag());
    QCOMPARE(m->mList->getWidgetItem(3)->y(), 3 * ScrollViewerFixture::ROW);
    QVERIFY(clone->isHidden());
    QCOMPARE(m->clock.running(), 0);
    m->takeLog();
    m->tap(100, 150);
    QCOMPARE(m->takeLog().first(), QStringLiteral("pressed 2"));
}

void TestScrollViewerMove::dropAtTheEnd()
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(4);
    m->mList->slotItemsCanDrag(true);
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

void TestScrollViewerMove::dropAtTheSamePlace()
{
    lift(2);
    m->move(50, 270);
    m->release(50, 270);
    QCOMPARE(m->order().mid(0, 4), (Names{"0", "1", "2", "3"}));
    QCOMPARE(m->takeLog().filter("dropped").size(), 1);
}

// On a busy machine all moves of a quick finger may be handled before the row is lifted.
void TestScrollViewerMove::fingerThatMovedBeforeTheLift()
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(20);
    m->mList->slotItemsCanDrag(true);
    m->press(50, 50);
    m->move(50, 150);
    m->move(50, 364);
    m->clock.advance(50);
    QVERIFY(m->mList->isDragging());
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

void TestScrollViewerMove::mouseThatMovedBeforeTheLift()
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(4);
    m->mList->slotItemsCanDrag(true);
    QWidget* row = m->mList->getWidgetItem(0);
    QTest::mousePress(row, Qt::LeftButton, Qt::NoModifier, QPoint(12, 50));
    QTest::mouseMove(row, QPoint(12, 53));
    QTest::mouseMove(row, QPoint(12, 260));
    m->clock.advance(50);
    QVERIFY(m->mList->isDragging());
    QTest::mouseRelease(m->mList->viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(50, 260));
    QCOMPARE(m->order(), (Names{"1", "2", "0", "3"}));
}

void TestScrollViewerMove::dropAtEdgeScrollsDown()
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
    // Up again.
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

void TestScrollViewerMove::edgeScrollingFasterFarOut()
{
    lift(2);
    const int height = ScrollViewerFixture::HEIGHT;
    const auto hang = [&](int overhang) { // by so much
        const KSBaseItemWidget* clone = m->mList->getMoveItem();
        const int bottom = clone->mapTo(&m->mWindow, QPoint(0, clone->height())).y() - m->mList->y();
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

void TestScrollViewerMove::edgeScrollingStopsInside()
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

void TestScrollViewerMove::cloneJumpsAside()
{
    lift(1);
    // 20 to the left and 20 down of where the row was, for a handle on the left.
    QCOMPARE(m->mList->getMoveItem()->pos(), QPoint(100 + 38 - 20, 100 + ScrollViewerFixture::ROW + 20));
    m->release(50, 154);
    for (int i = 0; i < m->mList->count(); ++i)
        m->mList->getWidgetItem(i)->setDragFlagAlignment(DRAGFLAG_RIGHT);
    m->press(390, 154);
    m->clock.advance(50);
    QCOMPARE(m->mList->getMoveItem()->pos(), QPoint(100 + 38 + 20, 100 + ScrollViewerFixture::ROW + 20));
    m->release(390, 154);
}

void TestScrollViewerMove::rowWithoutCloneFloatsItself()
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(5, false);
    m->mList->slotItemsCanDrag(true);
    KSBaseItemWidget* row = m->mList->getWidgetItem(1);
    m->press(50, 154);
    m->clock.advance(50);
    QCOMPARE(m->mList->getMoveItem(), row);
    QVERIFY(row->isVisible());
    m->move(50, 200);
    m->move(50, 364);
    m->release(50, 364);
    QCOMPARE(m->order(), (Names{"0", "2", "3", "1", "4"}));
    QVERIFY(row->isVisible());
    m->press(50, 50);
    m->clock.advance(50);
    m->release(50, 50);
    QCOMPARE(m->mList->getWidgetItem(3), row);
}

void TestScrollViewerMove::handleReleasedEarlyIsATap()
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_RIGHT);
    m->fill(5);
    m->mList->slotItemsCanDrag(true);
    m->press(390, 154);
    m->clock.advance(49);
    m->release(390, 154);
    m->clock.advance(100);
    QCOMPARE(m->takeLog(), (Names{"released 1", "clicked 1"}));
    QVERIFY(!m->mList->isDragging());
}

void TestScrollViewerMove::pressBesideTheHandleLiftsNothing()
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(5);
    m->mList->slotItemsCanDrag(true);
    m->press(38 + 36, 154);
    m->clock.advance(100);
    QVERIFY(!m->mList->isDragging());
    m->release(38 + 36, 154);
    m->mList->slotItemsCanDrag(false);
    m->press(50, 154);
    m->clock.advance(100);
    QVERIFY(!m->mList->isDragging());
    m->release(50, 154);
}

void TestScrollViewerMove::startMoveOfTheRowLifts()
{
    m->fill(5);
    m->press(200, 154);
    m->takeLog();
    KSBaseItemWidget* row = m->mList->getWidgetItem(1);
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

void TestScrollViewerMove::switchingOffDropsTheRow()
{
    lift(1);
    m->move(50, 160);
    m->move(50, 260);
    m->mList->slotItemsCanDrag(false);
    QVERIFY(!m->mList->isDragging());
    QCOMPARE(m->mList->count(), 20);
    for (int i = 0; i < 20; ++i)
        QVERIFY(!m->mList->getWidgetItem(i)->hasDragFlag());
    QCOMPARE(m->takeLog(), Names{"dropped"});
    m->release(50, 260);
    QCOMPARE(m->takeLog(), Names());
}

void TestScrollViewerMove::othersAreDeafWhileDragging()
{
    lift(1);
    // Past the application's filter, which would refuse it for itself.
    QCoreApplication::instance()->removeEventFilter(&m->mFilter);
    auto other = QTest::touchEvent(&m->mWindow, m_other, false);
    other.press(1, QPoint(200, 450), m->mList).commit();
    other.move(1, QPoint(200, 200), m->mList).commit();
    other.release(1, QPoint(200, 200), m->mList).commit();
    QCoreApplication::instance()->installEventFilter(&m->mFilter);
    QCOMPARE(m->takeLog(), Names());
    QVERIFY(m->mList->isDragging());
    m->release(50, 154);
}

void TestScrollViewerMove::addingWhileDraggingKeepsThePlace()
{
    lift(1);
    m->mList->addWidgetItem(new Row(QStringLiteral("new")), 0);
    m->mList->removeWidgetItem(m->mList->getWidgetItem(19));
    QVERIFY(m->mList->isDragging());
    m->release(50, 154);
    QCOMPARE(m->mList->count(), 20);
    QVERIFY(m->order().contains(QStringLiteral("1")));
    QVERIFY(m->order().contains(QStringLiteral("new")));
}

void TestScrollViewerMove::removingTheLiftedRow()
{
    lift(1);
    KSBaseItemWidget* row = m->mList->getMoveItem();
    QVERIFY(row);
    KSBaseItemWidget* lifted = m->mList->getSelectedItem();
    m->mList->removeWidgetItem(lifted);
    QVERIFY(!m->mList->isDragging());
    QVERIFY(lifted->isHidden());
    QCOMPARE(m->mList->count(), 19);
    QVERIFY(!QWidget::mouseGrabber());
    m->move(50, 300);
    m->release(50, 300);
    QCOMPARE(m->takeLog(), Names());
    m->mList->addWidgetItem(lifted, 1);
    QCOMPARE(m->order().mid(0, 3), (Names{"0", "1", "2"}));
    QVERIFY(lifted->isVisible());
}

void TestScrollViewerMove::clearingWhileDragging()
{
    lift(1);
    m->mList->removeAll();
    QVERIFY(m->mList->isEmpty());
    QVERIFY(!m->mList->isDragging());
    m->move(50, 300);
    m->release(50, 300);
    QCOMPARE(m->maximum(), 0);
    QCOMPARE(m->clock.running(), 0);
    m->fill(3);
    m->tap(100, 50);
    QCOMPARE(m->takeLog(), (Names{"pressed 0", "released 0", "clicked 0"}));
}

void TestScrollViewerMove::deletedWhileDragging()
{
    lift(1);
    delete m->mList->getSelectedItem();
    delete m->mList->getWidgetItem(0);
    QCOMPARE(m->mList->count(), 18);
    m->move(50, 200);
    m->clock.advance(100);
    m->release(50, 200);
    QVERIFY(!m->mList->isDragging());
    QVERIFY(!m->mList->getMoveItem());
    QCOMPARE(m->mList->count(), 18);
    QCOMPARE(m->mList->getWidgetItem(0)->y(), 0);
    QVERIFY(!m->mFilter.isLock(nullptr, LOCKMETHOD_TOUCH));
}

void TestScrollViewerMove::mouseLiftsAndDrops()
{
    m->mList->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    m->fill(5);
    m->mList->slotItemsCanDrag(true);
    QWidget* viewport = m->mList->viewport();
    QTest::mousePress(m->mList->getWidgetItem(1), Qt::LeftButton, Qt::NoModifier, QPoint(12, 50));
    m->clock.advance(50);
    QVERIFY(m->mList->isDragging());
    QTest::mouseMove(viewport, QPoint(50, 200));
    QTest::mouseMove(viewport, QPoint(50, 364));
    QTest::mouseRelease(viewport, Qt::LeftButton, Qt::NoModifier, QPoint(50, 364));
    QCOMPARE(m->order(), (Names{"0", "2", "3", "1", "4"}));
}

QTEST_MAIN(TestScrollViewerMove)
#include "tst_scrollviewermove.moc"

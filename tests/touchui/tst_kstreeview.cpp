// The touch tree under real fingers and the mouse, through the application's filter.
#include "TreeViewFixture.h"
#include "tests/support/Patience.h"

#include "tests/fakes/ManualClock.h"
#include "touchui/KSEventMutexLockObject.h"

class tst_kstreeview : public TreeViewFixture
{
    Q_OBJECT

private Q_SLOTS:
    void opensWithoutMakingHiddenChildren();
    void tapSelectsOnRelease();
    void tapOnTheIndicatorOpensAndCloses();
    void tapBesideTheRowsSelectsNothing();
    void disabledRowIsNotSelected();
    void slidingOffTheIndicatorDoesNothing();
    void holdMakesCurrentAndTells();
    void movementCancelsTheHold();
    void dragScrollsAndSelectsNothing();
    void flickGlidesOnAndComesToRest();
    void flickIntoTheEndShowsTheLastRowWhole();
    void flickAtTheTopDiesAtOnce();
    void brakeSelectsNothing();
    void fiveRowsOfPixelsAreNoFlick();
    void secondFingerIsIgnored();
    void trackedFingerLiftsFirst();
    void otherWidgetIsLockedOut();
    void cancelledTouchSelectsNothing();
    void lockedUnderTheFingerItWorksAfterwards_data();
    void lockedUnderTheFingerItWorksAfterwards();
    void hidingEndsEverything();
    void mouseTapsAndScrolls();
    void shortListDoesNotScroll();
    void dragCreepsByTwo();
    void flickStepIsAtLeastAPixel();

    void tapOnTheHeaderSorts();
    void cancelOnTheHeaderSortsNothing();
    void sortKeepsTheCurrentRow();
    void keysDoNotMoveTheSelection();
};

void tst_kstreeview::opensWithoutMakingHiddenChildren()
{
    TreeSource source;
    source.fill(200, 99);
    KSTreeModel model(&source, 3);
    KSTreeView tree;
    tree.setModel(&model);
    model.createDataItems();
    tree.resize(802, 570);
    tree.show();
    QVERIFY(QTest::qWaitForWindowExposed(&tree, PATIENCE_MS));
    tree.grab();
    tree.scrollToBottom();
    tree.grab();
    QCOMPARE(source.installed, 200);
    tree.expand(model.index(199, 0));
    tree.grab();
    QCOMPARE(source.installed, 299);
}

void tst_kstreeview::tapSelectsOnRelease()
{
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    QSignalSpy clicked(m_tree.get(), &QAbstractItemView::clicked);
    QSignalSpy current(m_tree->touch(), &TreeTouch::currentChangedByTouch);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(2), m_area);
    QVERIFY(!m_tree->currentIndex().isValid());
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(2) + QPoint(3, 3), m_area);
    QCOMPARE(m_tree->currentIndex(), m_model->index(2, 0));
    QVERIFY(m_tree->selectionModel()->isRowSelected(2, QModelIndex()));
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(clicked.count(), 1);
    QCOMPARE(current.count(), 1);
    QCOMPARE(current.at(0).at(0).toModelIndex(), m_model->index(2, 0));
    touchTap(rowPoint(4, 700)); // the date column
    QCOMPARE(m_tree->currentIndex(), m_model->index(4, 1));
}

void tst_kstreeview::tapOnTheIndicatorOpensAndCloses()
{
    const QModelIndex folder = m_model->index(1, 0);
    const QPoint indicator = m_tree->getIndicatorRect(folder).center();
    QTest::touchEvent(m_area, m_device).press(0, indicator, m_area);
    QVERIFY(m_tree->isIndicatorPressed(folder));
    QTest::touchEvent(m_area, m_device).release(0, indicator, m_area);
    QVERIFY(m_tree->isExpanded(folder));
    QVERIFY(!m_tree->isIndicatorPressed(folder));
    QVERIFY(!m_tree->currentIndex().isValid());
    const QModelIndex title = m_model->index(0, 0, folder);
    QVERIFY(m_tree->getIndicatorRect(title).isNull());
    touchTap(indicator);
    QVERIFY(!m_tree->isExpanded(folder));
}

void tst_kstreeview::tapBesideTheRowsSelectsNothing()
{
    m_model->removeRows(3, 37);
    touchTap(rowPoint(1));
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    touchTap(rowPoint(5));
    QCOMPARE(pressed.count(), 0);
    QCOMPARE(m_tree->currentIndex().row(), 1);
}

void tst_kstreeview::disabledRowIsNotSelected()
{
    m_model->setData(m_model->index(2, 0), false, KSVIEW::ItemEnableRole);
    touchTap(rowPoint(2));
    QVERIFY(!m_tree->currentIndex().isValid());
    touchTap(m_tree->getIndicatorRect(m_model->index(2, 0)).center());
    QVERIFY(!m_tree->isExpanded(m_model->index(2, 0)));
}

void tst_kstreeview::slidingOffTheIndicatorDoesNothing()
{
    const QModelIndex folder = m_model->index(1, 0);
    const QPoint indicator = m_tree->getIndicatorRect(folder).center();
    QTest::touchEvent(m_area, m_device).press(0, indicator, m_area);
    QTest::touchEvent(m_area, m_device).move(0, indicator + QPoint(60, 0), m_area);
    QVERIFY(!m_tree->isIndicatorPressed(folder));
    QTest::touchEvent(m_area, m_device).move(0, indicator, m_area);
    QTest::touchEvent(m_area, m_device).release(0, indicator, m_area);
    QVERIFY(!m_tree->isExpanded(folder));
    QVERIFY(!m_tree->currentIndex().isValid());
}

void tst_kstreeview::holdMakesCurrentAndTells()
{
    m_tree->touch()->setHoldInterval(30);
    QSignalSpy held(m_tree->touch(), &TreeTouch::pressedAndHeld);
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    QSignalSpy clicked(m_tree.get(), &QAbstractItemView::clicked);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(3), m_area);
    m_tree->allTimersReset();
    QTRY_COMPARE(held.count(), 1);
    QCOMPARE(held.at(0).at(0).toModelIndex(), m_model->index(3, 0));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(3), m_area);
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(clicked.count(), 0);
    QCOMPARE(held.count(), 1);
}

void tst_kstreeview::movementCancelsTheHold()
{
    m_tree->touch()->setHoldInterval(50);
    QSignalSpy held(m_tree->touch(), &TreeTouch::pressedAndHeld);
    // Sideways, so that no motion starts.
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(3), m_area);
    QTest::touchEvent(m_area, m_device)
        .move(0, rowPoint(3) + QPoint(QApplication::startDragDistance() + 1, 0), m_area);
    QTest::qWait(120);
    QCOMPARE(held.count(), 0);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(3), m_area);
    QVERIFY(!m_tree->currentIndex().isValid());
}

void tst_kstreeview::dragScrollsAndSelectsNothing()
{
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(8), m_area);
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(8) + QPoint(0, -10), m_area);
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(8) + QPoint(0, -210), m_area);
    QVERIFY(m_tree->hasFlicked());
    QVERIFY(!m_tree->isAutoFilck());
    // The list follows until it is within reach of the finger: the first movement does not count.
    QTRY_VERIFY(m_tree->isFlickEnd());
    QTRY_VERIFY(qAbs(m_tree->verticalScrollBar()->value() - 200) <= 10);
    const int value = m_tree->verticalScrollBar()->value();
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(8) + QPoint(0, -210), m_area);
    QVERIFY(!m_tree->isAutoFilck());
    QCOMPARE(m_tree->verticalScrollBar()->value(), value);
    QVERIFY(!m_tree->currentIndex().isValid());
}

void tst_kstreeview::flickGlidesOnAndComesToRest()
{
    swipe(rowPoint(8), -30, 3);
    QVERIFY(m_tree->isAutoFilck());
    QTRY_VERIFY(!m_tree->isAutoFilck());
    const int value = m_tree->verticalScrollBar()->value();
    QVERIFY2(value > 60, qPrintable(QString::number(value)));
    QVERIFY(value < m_tree->verticalScrollBar()->maximum());
    QVERIFY(!m_tree->currentIndex().isValid());
    // It slows down.
    QVERIFY(qAbs(m_tree->offsets.constLast()) < qAbs(m_tree->offsets.constFirst()));
}

void tst_kstreeview::flickIntoTheEndShowsTheLastRowWhole()
{
    swipe(rowPoint(10), -450, 3);
    QVERIFY(m_tree->isAutoFilck());
    QTRY_VERIFY(!m_tree->isAutoFilck());
    QScrollBar* bar = m_tree->verticalScrollBar();
    QCOMPARE(bar->value(), bar->maximum());
    QCOMPARE(m_tree->visualRect(m_model->index(39, 0)).bottom(), m_area->height() - 1);
    touchTap(QPoint(300, m_area->height() - 10)); // no brake: nothing glides any more
    QCOMPARE(m_tree->currentIndex().row(), 39);
}

void tst_kstreeview::flickAtTheTopDiesAtOnce()
{
    swipe(rowPoint(1), 300, 2);
    QTRY_VERIFY(!m_tree->isAutoFilck());
    QCOMPARE(m_tree->verticalScrollBar()->value(), 0);
    QVERIFY(m_tree->ticks <= 3);
}

void tst_kstreeview::brakeSelectsNothing()
{
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    swipe(rowPoint(8), -60, 3);
    QVERIFY(m_tree->isAutoFilck());
    QTRY_VERIFY(m_tree->verticalScrollBar()->value() > 0);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(5), m_area);
    QVERIFY(!m_tree->isAutoFilck());
    const int value = m_tree->verticalScrollBar()->value();
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(5), m_area);
    QTest::qWait(80); // two ticks, if there were any
    QCOMPARE(m_tree->verticalScrollBar()->value(), value);
    QVERIFY(!m_tree->currentIndex().isValid());
    QCOMPARE(pressed.count(), 0);
    touchTap(rowPoint(5));
    QCOMPARE(pressed.count(), 1);
}

void tst_kstreeview::fiveRowsOfPixelsAreNoFlick()
{
    m_tree->setStartPoint(QPoint(0, 0));
    for (const int y : {5, -5, 0}) {
        m_tree->setEndPoint(QPoint(50, y));
        QVERIFY(m_tree->isFlickEnd());
        QVERIFY(!m_tree->hasFlicked());
    }
    m_tree->setEndPoint(QPoint(0, -6));
    QVERIFY(!m_tree->isFlickEnd());
    QVERIFY(m_tree->hasFlicked());
    m_tree->stopFlick();
    QVERIFY(m_tree->hasFlicked());
    m_tree->setStartPoint(QPoint(0, -6));
    QVERIFY(!m_tree->hasFlicked());
}

void tst_kstreeview::secondFingerIsIgnored()
{
    auto touch = QTest::touchEvent(m_area, m_device, false);
    touch.press(0, rowPoint(2), m_area).commit();
    touch.stationary(0).press(1, rowPoint(6), m_area).commit();
    touch.stationary(0).move(1, rowPoint(1), m_area).commit();
    touch.stationary(0).release(1, rowPoint(1), m_area).commit();
    QVERIFY(!m_tree->hasFlicked());
    QVERIFY(!m_tree->currentIndex().isValid());
    touch.release(0, rowPoint(2), m_area).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
}

void tst_kstreeview::trackedFingerLiftsFirst()
{
    auto touch = QTest::touchEvent(m_area, m_device, false);
    touch.press(0, rowPoint(2), m_area).commit();
    touch.stationary(0).press(1, rowPoint(6), m_area).commit();
    touch.release(0, rowPoint(2), m_area).stationary(1).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
    touch.move(1, rowPoint(1), m_area).commit();
    touch.release(1, rowPoint(1), m_area).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
    QVERIFY(!m_tree->hasFlicked());
    touchTap(rowPoint(4));
    QCOMPARE(m_tree->currentIndex().row(), 4);
}

void tst_kstreeview::otherWidgetIsLockedOut()
{
    QWidget* head = m_tree->header()->viewport();
    QSignalSpy sorted(m_tree->header(), &QHeaderView::sectionClicked);
    auto touch = QTest::touchEvent(m_tree.get(), m_device, false);
    touch.press(0, rowPoint(2), m_area).commit();
    touch.stationary(0).press(1, QPoint(100, 20), head).commit();
    touch.stationary(0).release(1, QPoint(100, 20), head).commit();
    QCOMPARE(sorted.count(), 0);
    touch.release(0, rowPoint(2), m_area).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
}

void tst_kstreeview::cancelledTouchSelectsNothing()
{
    m_tree->touch()->setHoldInterval(40);
    QSignalSpy held(m_tree->touch(), &TreeTouch::pressedAndHeld);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(2), m_area);
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QApplication::sendEvent(m_area, &cancel);
    QTest::qWait(100);
    QCOMPARE(held.count(), 0);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(2), m_area);
    QVERIFY(!m_tree->currentIndex().isValid());
    touchTap(rowPoint(2));
    QCOMPARE(m_tree->currentIndex().row(), 2);
}

void tst_kstreeview::lockedUnderTheFingerItWorksAfterwards_data()
{
    QTest::addColumn<bool>("onTheHeader");
    QTest::newRow("rows") << false;
    QTest::newRow("header") << true;
}

void tst_kstreeview::lockedUnderTheFingerItWorksAfterwards()
{
    QFETCH(bool, onTheHeader);
    ManualClock clock;
    m_tree->setSortingEnabled(true);
    const std::unique_ptr<KSLockObject> lock(KSEventMutexLockObject::createFactory(nullptr));
    QWidget* const area = onTheHeader ? m_tree->header()->viewport() : m_area;
    const QPoint point = onTheHeader ? QPoint(100, 20) : rowPoint(2);
    QSignalSpy held(m_tree->touch(), &TreeTouch::pressedAndHeld);
    QSignalSpy clicked(m_tree.get(), &KSTreeView::clicked);
    QSignalSpy sorted(m_tree->header(), &QHeaderView::sectionClicked);
    QTest::touchEvent(area, m_device).press(0, point, area);
    m_filter->lock(lock.get());
    QTest::touchEvent(area, m_device).release(0, point, area);
    m_filter->unlock();
    clock.advance(2000);
    QCOMPARE(held.count() + clicked.count() + sorted.count(), 0);
    QTest::touchEvent(area, m_device).press(0, point, area);
    QTest::touchEvent(area, m_device).release(0, point, area);
    QCOMPARE(clicked.count() + sorted.count(), 1);
}

void tst_kstreeview::hidingEndsEverything()
{
    m_tree->touch()->setHoldInterval(40);
    QSignalSpy held(m_tree->touch(), &TreeTouch::pressedAndHeld);
    swipe(rowPoint(8), -60, 3);
    QVERIFY(m_tree->isAutoFilck());
    m_tree->hide();
    QVERIFY(!m_tree->isAutoFilck());
    m_tree->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_tree.get(), PATIENCE_MS));
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(2), m_area);
    m_tree->hide();
    QTest::qWait(100);
    QCOMPARE(held.count(), 0);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(2), m_area);
}

void tst_kstreeview::mouseTapsAndScrolls()
{
    QTest::mouseClick(m_area, Qt::LeftButton, {}, rowPoint(3));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QTest::mouseClick(m_area, Qt::RightButton, {}, rowPoint(5));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QTest::mouseDClick(m_area, Qt::LeftButton, {}, rowPoint(4)); // does not release
    QTest::mouseRelease(m_area, Qt::LeftButton, {}, rowPoint(4));
    QCOMPARE(m_tree->currentIndex().row(), 4);
    QVERIFY(!m_tree->isExpanded(m_model->index(4, 0)));
    QTest::mousePress(m_area, Qt::LeftButton, {}, rowPoint(8));
    QTest::mouseMove(m_area, rowPoint(8) + QPoint(0, -20));
    QTest::mouseMove(m_area, rowPoint(8) + QPoint(0, -220));
    QTRY_VERIFY(m_tree->isFlickEnd());
    QTRY_VERIFY(qAbs(m_tree->verticalScrollBar()->value() - 200) <= 10);
    QTest::mouseRelease(m_area, Qt::LeftButton, {}, rowPoint(8) + QPoint(0, -220));
    QCOMPARE(m_tree->currentIndex().row(), 4);
    m_tree->verticalScrollBar()->setValue(0);
    QTest::mouseClick(m_area, Qt::LeftButton, {}, m_tree->getIndicatorRect(m_model->index(1, 0)).center());
    QVERIFY(m_tree->isExpanded(m_model->index(1, 0)));
}

void tst_kstreeview::shortListDoesNotScroll()
{
    m_model->removeRows(3, 37);
    swipe(rowPoint(1), -200, 3);
    QTRY_VERIFY(!m_tree->isAutoFilck());
    QCOMPARE(m_tree->verticalScrollBar()->value(), 0);
    touchTap(rowPoint(1));
    QCOMPARE(m_tree->currentIndex().row(), 1);
}

void tst_kstreeview::dragCreepsByTwo()
{
    m_tree->setStartPoint(QPoint(100, 100));
    m_tree->setEndPoint(QPoint(100, 100));
    QCOMPARE(m_tree->getDragDistance(), QPoint(0, 1));
    m_tree->setStartPoint(QPoint(100, 100));
    m_tree->setEndPoint(QPoint(110, 99));
    QCOMPARE(m_tree->getDragDistance(), QPoint(5, -1));
    m_tree->setStartPoint(QPoint(0, 0));
    m_tree->setEndPoint(QPoint(0, 5));
    QCOMPARE(m_tree->getDragDistance(), QPoint(0, 2));
}

void tst_kstreeview::flickStepIsAtLeastAPixel()
{
    m_tree->setStartPoint(QPoint(0, 0));
    m_tree->setEndPoint(QPoint(0, -4));
    for (int y = -4; y < 0; ++y)
        QCOMPARE(m_tree->getFlickDistance().y(), y / 2);
}

void tst_kstreeview::tapOnTheHeaderSorts()
{
    m_tree->setSortingEnabled(true);
    QCOMPARE(m_model->index(0, 0).data().toString(), QStringLiteral("Folder 000"));
    QWidget* head = m_tree->header()->viewport();
    for (const char* first : {"Folder 000", "Folder 039", "Folder 000"}) {
        QTest::touchEvent(head, m_device).press(0, QPoint(100, 20), head);
        QTest::touchEvent(head, m_device).release(0, QPoint(100, 20), head);
        QCOMPARE(m_model->index(0, 0).data().toString(), QLatin1String(first));
    }
    QTest::mouseClick(head, Qt::LeftButton, {}, QPoint(100, 20));
    QCOMPARE(m_model->index(0, 0).data().toString(), QStringLiteral("Folder 039"));
}

void tst_kstreeview::cancelOnTheHeaderSortsNothing()
{
    m_tree->setSortingEnabled(true);
    QWidget* head = m_tree->header()->viewport();
    QSignalSpy clicked(m_tree->header(), &QHeaderView::sectionClicked);
    QTest::touchEvent(head, m_device).press(0, QPoint(100, 20), head);
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QApplication::sendEvent(head, &cancel);
    QCOMPARE(clicked.count(), 0);
    QTest::touchEvent(head, m_device).release(0, QPoint(100, 20), head);
    QTest::touchEvent(head, m_device).press(0, QPoint(100, 20), head);
    QTest::touchEvent(head, m_device).move(0, QPoint(600, 20), head); // off the section
    QTest::touchEvent(head, m_device).release(0, QPoint(600, 20), head);
    QCOMPARE(clicked.count(), 0);
    QCOMPARE(m_tree->header()->sortIndicatorSection(), -1);
}

void tst_kstreeview::sortKeepsTheCurrentRow()
{
    m_tree->expand(m_model->index(2, 0));
    m_tree->setCurrentIndex(m_model->index(1, 0, m_model->index(2, 0)));
    m_tree->setSortingEnabled(true);
    m_tree->sortByColumn(0, Qt::DescendingOrder);
    QCOMPARE(m_tree->currentIndex().parent().row(), 37);
    QCOMPARE(m_tree->currentIndex().data().toString(), QStringLiteral("Title 1"));
    QVERIFY(m_tree->isExpanded(m_model->index(37, 0)));
}

void tst_kstreeview::keysDoNotMoveTheSelection()
{
    m_tree->setCurrentIndex(m_model->index(5, 0));
    for (const int key : {Qt::Key_Space, Qt::Key_Home, Qt::Key_End, Qt::Key_Up, Qt::Key_Down, Qt::Key_Left,
                          Qt::Key_Right, Qt::Key_PageUp, Qt::Key_PageDown, Qt::Key_F}) {
        QTest::keyClick(m_tree.get(), static_cast<Qt::Key>(key));
        QCOMPARE(m_tree->currentIndex().row(), 5);
    }
    QVERIFY(!m_tree->isExpanded(m_model->index(5, 0)));
}

QTEST_MAIN(tst_kstreeview)
#include "tst_kstreeview.moc"

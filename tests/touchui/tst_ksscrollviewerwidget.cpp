// A finger's life on a list: tap, hold, scroll, flick, brake, with others beside it.
#include "ScrollViewerTest.h"
#include "tests/support/Patience.h"

#include "touchui/KSScrollBar.h"

#include <QSignalSpy>
#include <QWheelEvent>

using Names = QStringList;

class tst_ksscrollviewerwidget : public ScrollViewerTest
{
    Q_OBJECT
private Q_SLOTS:
    void tap();
    void tapInTheGapBelongsToTheRowAbove();
    void tapBelowTheLastRow();
    void tapBesideTheRowsSaysNothing();
    void hold();
    void holdInRealTime();
    void holdInEmptyArea();
    void slopOfTheFinger_data();
    void slopOfTheFinger();
    void slopOfTheMouse_data();
    void slopOfTheMouse();
    void rightPress();
    void scrollFollowsTheFinger();
    void fiveFirstPixelsAreNoFlick();
    void flickGlidesAndRests();
    void flickDiesAtTheEnd();
    void quickFlickTapsNothing();
    void quickShortSlideIsATap();
    void brakeTapsNothing();
    void boundedDragDoesNotRunOn();
    void leavingTheRowEndsThePress();
    void switchedOffItDoesNotFollow();
    void takenTouchGoesToTheRow();
    void mouseDragScrolls();
    void mouseKeepsTheRowInside();

    void secondFingerOnAnotherRow();
    void secondFingerOnTheSameRow();
    void firstFingerLiftedFirst();
    void cancelledTap();
    void cancelledDrag();
    void hidingEndsThePress();
    void clearedUnderTheFinger();
    void remoteLockMidTouch();
    void timersCanStartAnew();
    void stretchTimerAligns();
    void barUnderTheFinger();
    void pressOnTheBarBrakes();
};

void tst_ksscrollviewerwidget::tap()
{
    m->fill(20);
    m->press(100, 150);
    QCOMPARE(m->takeLog(), Names{"pressed 1"});
    QVERIFY(!m->m_filter.activateLockObjects().isEmpty());
    m->release(100, 150);
    QCOMPARE(m->takeLog(), (Names{"released 1", "clicked 1"}));
    m->clock.advance(2000);
    QCOMPARE(m->takeLog(), Names());
    QCOMPARE(m->clock.running(), 0);
    QCOMPARE(m->value(), 0);
}

void tst_ksscrollviewerwidget::tapInTheGapBelongsToTheRowAbove()
{
    m->fill(20);
    m->press(100, 102);
    QCOMPARE(m->takeLog(), Names{"pressed 0"});
    m->release(100, 102);
    // The press is the row's, but the finger is on no row.
    QCOMPARE(m->takeLog(), Names());
}

void tst_ksscrollviewerwidget::tapBelowTheLastRow()
{
    m->fill(2);
    m->press(100, 400);
    m->release(100, 400);
    QCOMPARE(m->takeLog(), (Names{"pressed -", "released -"}));
}

void tst_ksscrollviewerwidget::tapBesideTheRowsSaysNothing()
{
    m->fill(20);
    m->m_list->setHEffectiveArea(200, 200);
    m->press(150, 150);
    m->clock.advance(800);
    m->release(150, 150);
    QCOMPARE(m->takeLog(), Names());
    // But the list can be flicked from there.
    m->press(150, 400);
    m->drag(150, 400, 200, 10);
    QVERIFY(m->value() > 100);
    m->release(150, 200);
    QCOMPARE(m->takeLog(), Names());
    m->tap(200, 150);
    m->takeLog();
    m->clock.advance(40000);
    m->tap(200, 150);
    QCOMPARE(m->takeLog().size(), 3);
}

void tst_ksscrollviewerwidget::hold()
{
    m->fill(20);
    m->press(100, 150);
    m->takeLog();
    m->clock.advance(699);
    QCOMPARE(m->takeLog(), Names());
    m->clock.advance(1);
    QCOMPARE(m->takeLog(), Names{"held 1"});
    m->clock.advance(5000);
    m->release(100, 150);
    QCOMPARE(m->takeLog(), (Names{"released 1", "clicked 1"}));
}

void tst_ksscrollviewerwidget::holdInRealTime()
{
    TouchTimer::setClock(nullptr);
    m->fill(20);
    m->press(100, 150);
    m->takeLog();
    QTRY_COMPARE(m->log, Names{"held 1"});
    m->release(100, 150);
}

void tst_ksscrollviewerwidget::holdInEmptyArea()
{
    m->press(100, 150);
    m->clock.advance(700);
    m->release(100, 150);
    QCOMPARE(m->takeLog(), (Names{"pressed -", "held -", "released -"}));
}

void tst_ksscrollviewerwidget::slopOfTheFinger_data()
{
    QTest::addColumn<QPoint>("way");
    QTest::addColumn<bool>("held");
    QTest::newRow("20 right") << QPoint(20, 0) << true;
    QTest::newRow("21 right") << QPoint(21, 0) << false;
    QTest::newRow("10 and 10") << QPoint(10, -10) << true;
    QTest::newRow("10 and 11") << QPoint(10, -11) << false;
    QTest::newRow("20 up") << QPoint(0, -20) << true;
    QTest::newRow("21 down") << QPoint(0, 21) << false;
}

void tst_ksscrollviewerwidget::slopOfTheFinger()
{
    QFETCH(QPoint, way);
    QFETCH(bool, held);
    m->fill(20);
    m->press(100, 150);
    m->move(100 + way.x(), 150 + way.y());
    m->takeLog();
    m->clock.advance(800);
    QCOMPARE(m->takeLog(), held ? Names{"held 1"} : Names());
    m->release(100 + way.x(), 150 + way.y());
}

void tst_ksscrollviewerwidget::slopOfTheMouse_data()
{
    QTest::addColumn<QPoint>("way");
    QTest::addColumn<bool>("held");
    QTest::newRow("5") << QPoint(5, 0) << true;
    QTest::newRow("6") << QPoint(6, 0) << false;
    QTest::newRow("3 and 2") << QPoint(3, 2) << true;
    QTest::newRow("3 and 3") << QPoint(3, 3) << false;
}

void tst_ksscrollviewerwidget::slopOfTheMouse()
{
    QFETCH(QPoint, way);
    QFETCH(bool, held);
    m->fill(20);
    QWidget* row = m->m_list->getWidgetItem(1);
    QTest::mousePress(row, Qt::LeftButton, Qt::NoModifier, QPoint(60, 50));
    QTest::mouseMove(row, QPoint(60, 50) + way);
    QCOMPARE(m->takeLog(), Names{"pressed 1"});
    m->clock.advance(800);
    QCOMPARE(m->takeLog(), held ? Names{"held 1"} : Names());
    QTest::mouseRelease(row, Qt::LeftButton, Qt::NoModifier, QPoint(60, 50) + way);
}

void tst_ksscrollviewerwidget::rightPress()
{
    m->fill(2);
    QTest::mouseClick(m->m_list->getWidgetItem(1), Qt::RightButton);
    m->clock.advance(800);
    QCOMPARE(m->takeLog(), Names{"right 1"});
    QTest::mouseClick(m->m_list->viewport(), Qt::RightButton, Qt::NoModifier, QPoint(100, 450));
    QCOMPARE(m->takeLog(), Names{"right -"});
}

void tst_ksscrollviewerwidget::scrollFollowsTheFinger()
{
    m->fill(20);
    QSignalSpy visible(m->m_list, &KSScrollViewerWidget::signalVisibleItemsChange);
    m->press(100, 495);
    m->move(100, 490); // where the motion starts
    m->drag(100, 490, 190, 10);
    m->clock.advance(33 * 8);
    QVERIFY2(qAbs(m->value() - 300) <= 15, qPrintable(QString::number(m->value())));
    QCOMPARE(m->m_list->firstVisibleItem(), m->value() / ScrollViewerFixture::ROW);
    QVERIFY(visible.count() >= 3);
    m->takeLog();
    // The finger has come to rest before it leaves.
    m->release(100, 190);
    QCOMPARE(m->takeLog(), Names{"colour 4"});
    const int rest = m->value();
    m->clock.advance(5000);
    QCOMPARE(m->value(), rest);
    QCOMPARE(m->clock.running(), 0);
}

void tst_ksscrollviewerwidget::fiveFirstPixelsAreNoFlick()
{
    m->fill(20);
    m->press(100, 150);
    m->move(100, 150);
    m->move(100, 145);
    m->clock.advance(330);
    QCOMPARE(m->value(), 0);
    QVERIFY(!m->m_list->hasFlicked());
    m->release(100, 145);
    QCOMPARE(m->takeLog(), (Names{"pressed 1", "released 1", "clicked 1"}));
    QVERIFY(!m->m_list->isAutoFilck());
}

void tst_ksscrollviewerwidget::flickGlidesAndRests()
{
    m->fill(60);
    m->press(100, 400);
    m->drag(100, 400, 340, 3);
    m->move(100, 300);
    m->release(100, 300);
    QVERIFY(m->m_list->isAutoFilck());
    int last = m->value();
    int step = 0;
    int ticks = 0;
    for (; m->m_list->isAutoFilck() && ticks < 1000; ++ticks) {
        m->clock.advance(33);
        const int now = m->value() - last;
        QVERIFY2(now <= step || ticks == 0, "the flick speeds up");
        QVERIFY(now >= 0);
        step = now;
        last = m->value();
    }
    QVERIFY(ticks > 10 && ticks < 300);
    QVERIFY(m->value() > 100);
    QCOMPARE(m->clock.running(), 0);
    QCOMPARE(m->takeLog().size(), 2); // pressed, colour
}

void tst_ksscrollviewerwidget::flickDiesAtTheEnd()
{
    m->fill(7);
    const int end = m->maximum();
    QVERIFY(end > 0);
    m->press(100, 450);
    m->drag(100, 450, 400, 3);
    m->move(100, 50);
    m->release(100, 50);
    QVERIFY(m->m_list->isAutoFilck());
    m->clock.advance(33 * 3);
    QCOMPARE(m->value(), end);
    QVERIFY(!m->m_list->isAutoFilck());
    QCOMPARE(m->clock.running(), 0);
    // And at the start.
    m->press(100, 50);
    m->drag(100, 50, 100, 3);
    m->move(100, 450);
    m->release(100, 450);
    m->clock.advance(33 * 3);
    QCOMPARE(m->value(), 0);
    QCOMPARE(m->clock.running(), 0);
}

void tst_ksscrollviewerwidget::quickFlickTapsNothing()
{
    m->fill(40);
    m->press(100, 250);
    m->move(100, 249);
    m->move(100, 215);
    m->release(100, 212); // all within one tick, and still on the row
    QCOMPARE(m->takeLog(), (Names{"pressed 2", "colour 2"}));
    m->clock.advance(330);
    QVERIFY(m->value() > 10);
}

// However quick: a finger never lies quite still.
void tst_ksscrollviewerwidget::quickShortSlideIsATap()
{
    m->fill(40);
    m->press(100, 250);
    m->move(100, 248);
    m->move(100, 238);
    m->release(100, 238);
    QCOMPARE(m->takeLog(), (Names{"pressed 2", "released 2", "clicked 2"}));
}

void tst_ksscrollviewerwidget::brakeTapsNothing()
{
    m->fill(60);
    m->press(100, 400);
    m->drag(100, 400, 340, 3);
    m->move(100, 100);
    m->release(100, 100);
    m->clock.advance(99);
    QVERIFY(m->m_list->isAutoFilck());
    m->takeLog();
    m->press(100, 250);
    QVERIFY(!m->m_list->isAutoFilck());
    const int braked = m->value();
    m->clock.advance(2000); // nor does it become a hold
    m->release(100, 250);
    QCOMPARE(m->value(), braked);
    QCOMPARE(m->takeLog(), Names());
    // The next one is a tap again.
    m->tap(100, 250);
    QCOMPARE(m->takeLog().size(), 3);
}

void tst_ksscrollviewerwidget::boundedDragDoesNotRunOn()
{
    m->fill(60);
    m->press(100, 250);
    m->move(100, 249);
    // Far above the list: the row under the finger stops at its upper edge.
    for (int i = 0; i < 30; ++i) {
        m->move(100, -300);
        m->clock.advance(33);
    }
    const int top = m->m_list->getWidgetItem(2)->mapTo(m->m_list, QPoint()).y();
    QVERIFY2(top >= 0 && top <= 1, qPrintable(QString::number(top)));
    m->release(100, -300);
    QVERIFY(!m->m_list->isAutoFilck());
    const int rest = m->value();
    m->clock.advance(3000);
    QCOMPARE(m->value(), rest);
}

void tst_ksscrollviewerwidget::leavingTheRowEndsThePress()
{
    m->fill(3); // too few to scroll
    m->press(100, 150);
    m->move(100, 240);
    m->release(100, 150);
    QCOMPARE(m->takeLog(), Names{"pressed 1"});
}

void tst_ksscrollviewerwidget::switchedOffItDoesNotFollow()
{
    m->fill(20);
    m->press(100, 400);
    m->move(100, 390);
    m->m_list->setFlickAbility(false);
    m->drag(100, 390, 100, 10);
    m->release(100, 100);
    QCOMPARE(m->value(), 0);
    QVERIFY(!m->m_list->isAutoFilck());
    m->takeLog();
    m->tap(100, 150); // on again, and nothing to brake
    QCOMPARE(m->takeLog(), (Names{"pressed 1", "released 1", "clicked 1"}));
}

void tst_ksscrollviewerwidget::takenTouchGoesToTheRow()
{
    m->fill(20);
    m->m_list->setIsTake(true);
    QSignalSpy down(m->m_list->getWidgetItem(1), &QAbstractButton::pressed);
    m->press(100, 150);
    QCOMPARE(down.count(), 1);
    m->drag(100, 150, 50, 5);
    QCOMPARE(m->value(), 0);
    m->release(100, 50);
    m->m_list->setIsTake(false);
}

void tst_ksscrollviewerwidget::mouseDragScrolls()
{
    m->fill(20);
    QWidget* viewport = m->m_list->viewport();
    QTest::mousePress(m->m_list->getWidgetItem(3), Qt::LeftButton, Qt::NoModifier, QPoint(60, 50));
    for (int y = 360; y >= 160; y -= 20)
        QTest::mouseMove(viewport, QPoint(100, y));
    QTest::mouseRelease(viewport, Qt::LeftButton, Qt::NoModifier, QPoint(100, 160));
    QCOMPARE(m->takeLog(), (Names{"pressed 3", "colour 3"}));
    QCOMPARE(m->value(), 362 - 160);
    m->clock.advance(2000);
    QCOMPARE(m->value(), 362 - 160); // no flick
}

void tst_ksscrollviewerwidget::mouseKeepsTheRowInside()
{
    m->fill(20);
    QWidget* viewport = m->m_list->viewport();
    QTest::mousePress(m->m_list->getWidgetItem(3), Qt::LeftButton, Qt::NoModifier, QPoint(60, 50));
    for (int y = 360; y >= -400; y -= 20)
        QTest::mouseMove(viewport, QPoint(100, y));
    QCOMPARE(m->value(), 3 * ScrollViewerFixture::ROW);
    QTest::mouseRelease(viewport, Qt::LeftButton, Qt::NoModifier, QPoint(100, -400));
}

void tst_ksscrollviewerwidget::secondFingerOnAnotherRow()
{
    m->fill(20);
    auto fingers = m->fingers();
    fingers.press(0, QPoint(100, 50), m->m_list).commit();
    fingers.stationary(0).press(1, QPoint(300, 450), m->m_list).commit();
    fingers.stationary(0).move(1, QPoint(300, 100), m->m_list).commit();
    m->clock.advance(330);
    QCOMPARE(m->value(), 0);
    fingers.stationary(0).release(1, QPoint(300, 100), m->m_list).commit();
    fingers.release(0, QPoint(100, 50), m->m_list).commit();
    QCOMPARE(m->takeLog(), (Names{"pressed 0", "released 0", "clicked 0"}));
}

void tst_ksscrollviewerwidget::secondFingerOnTheSameRow()
{
    m->fill(20);
    auto fingers = m->fingers();
    fingers.press(0, QPoint(100, 50), m->m_list).commit();
    fingers.stationary(0).press(1, QPoint(140, 50), m->m_list).commit();
    fingers.stationary(0).move(1, QPoint(140, 300), m->m_list).commit();
    fingers.stationary(0).release(1, QPoint(140, 300), m->m_list).commit();
    fingers.release(0, QPoint(100, 50), m->m_list).commit();
    QCOMPARE(m->takeLog(), (Names{"pressed 0", "released 0", "clicked 0"}));
    QCOMPARE(m->value(), 0);
}

void tst_ksscrollviewerwidget::firstFingerLiftedFirst()
{
    m->fill(20);
    auto fingers = m->fingers();
    fingers.press(0, QPoint(100, 50), m->m_list).commit();
    fingers.stationary(0).press(1, QPoint(140, 50), m->m_list).commit();
    fingers.release(0, QPoint(100, 50), m->m_list).stationary(1).commit();
    QCOMPARE(m->takeLog(), (Names{"pressed 0", "released 0", "clicked 0"}));
    fingers.move(1, QPoint(140, 90), m->m_list).commit();
    fingers.release(1, QPoint(140, 90), m->m_list).commit();
    QCOMPARE(m->takeLog(), Names());
    QCOMPARE(m->clock.running(), 0);
}

void tst_ksscrollviewerwidget::cancelledTap()
{
    m->fill(20);
    m->press(100, 150);
    m->takeLog();
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QCoreApplication::sendEvent(m->m_list->getWidgetItem(1), &cancel);
    m->clock.advance(2000);
    QCOMPARE(m->takeLog(), Names());
    m->release(100, 150);
    QCOMPARE(m->takeLog(), Names());
    m->tap(100, 150);
    QCOMPARE(m->takeLog().size(), 3);
}

void tst_ksscrollviewerwidget::cancelledDrag()
{
    lift(1);
    KSBaseItemWidget* row = m->m_list->getSelectedItem();
    m->move(50, 160);
    m->move(50, 264);
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QCoreApplication::sendEvent(row, &cancel);
    QVERIFY(!m->m_list->isDragging());
    QCOMPARE(m->order().mid(0, 4), (Names{"0", "1", "2", "3"}));
    QCOMPARE(m->takeLog(), Names{"dropped"});
    m->release(50, 264);
    QCOMPARE(m->takeLog(), Names());
    QVERIFY(!QWidget::mouseGrabber());
}

void tst_ksscrollviewerwidget::hidingEndsThePress()
{
    m->fill(20);
    m->press(100, 150);
    m->takeLog();
    m->m_list->hide();
    m->clock.advance(2000);
    m->release(100, 150);
    QCOMPARE(m->takeLog(), Names());
    QCOMPARE(m->clock.running(), 0);
    m->m_list->show();
}

void tst_ksscrollviewerwidget::clearedUnderTheFinger()
{
    m->fill(20);
    m->press(100, 150);
    m->takeLog();
    for (int i = m->m_list->count() - 1; i >= 0; --i)
        delete m->m_list->getWidgetItem(i);
    m->clock.advance(2000);
    m->move(100, 300);
    m->release(100, 300);
    QVERIFY(!m->takeLog().join(QLatin1Char(' ')).contains(QLatin1Char('1')));
    // The row was the target, so its lock waits for the watchdog.
    m->m_filter.resetLock();
}

void tst_ksscrollviewerwidget::remoteLockMidTouch()
{
    m->fill(20);
    m->press(100, 150);
    QCOMPARE(m->takeLog(), Names{"pressed 1"});
    m->m_filter.resetLock(); // as another process's lock does
    m->move(100, 400);
    m->release(100, 400);
    QCOMPARE(m->takeLog(), Names());
    m->clock.advance(2000);
    m->takeLog();
    m->tap(100, 150);
    QCOMPARE(m->takeLog(), (Names{"pressed 1", "released 1", "clicked 1"}));
}

void tst_ksscrollviewerwidget::timersCanStartAnew()
{
    m->fill(20);
    m->press(100, 150);
    m->takeLog();
    m->clock.advance(600);
    m->m_list->allTimersReset();
    m->clock.advance(600);
    QCOMPARE(m->takeLog(), Names());
    m->clock.advance(100);
    QCOMPARE(m->takeLog(), Names{"held 1"});
    m->release(100, 150);
    m->press(100, 150);
    m->takeLog();
    m->m_list->stopTapAndHoldTimer();
    m->clock.advance(900);
    QCOMPARE(m->takeLog(), Names());
    m->release(100, 150);
}

void tst_ksscrollviewerwidget::stretchTimerAligns()
{
    m->fill(20);
    m->m_list->slotSetScrollBarValue(130);
    QSignalSpy stopped(m->m_list, &KSScrollViewerWidget::minitrimStop);
    m->m_list->slotHandleStretchTimer();
    QCOMPARE(m->value(), ScrollViewerFixture::ROW);
    QCOMPARE(stopped.count(), 1);
    m->m_list->slotSetScrollBarValue(m->maximum());
    m->m_list->slotHandleStretchTimer();
    QCOMPARE(m->value(), m->maximum());
    QCOMPARE(stopped.count(), 2);
}

void tst_ksscrollviewerwidget::barUnderTheFinger()
{
    m->fill(20);
    KSScrollBar* bar = m->m_list->getVScrollBar();
    QVERIFY(bar->isVisible());
    const QRect handle = bar->handleRect();
    QTest::touchEvent(bar, m_device).press(0, handle.center());
    QVERIFY(bar->isPressed());
    QCOMPARE(m->value(), 0);
    QTest::touchEvent(bar, m_device).move(0, handle.center() + QPoint(0, 100));
    QVERIFY(m->value() > 100);
    QTest::touchEvent(bar, m_device).release(0, handle.center() + QPoint(0, 100));
    QVERIFY(!bar->isPressed());
    QCOMPARE(m->takeLog(), Names());
    // Beside the handle the list jumps there.
    QTest::touchEvent(bar, m_device).press(0, QPoint(16, 450));
    QVERIFY(m->value() > 1000);
    QVERIFY(bar->handleRect().contains(16, 450));
    QTest::touchEvent(bar, m_device).release(0, QPoint(16, 450));
    QCOMPARE(bar->value(), m->value());
}

void tst_ksscrollviewerwidget::pressOnTheBarBrakes()
{
    m->fill(60);
    m->press(100, 400);
    m->drag(100, 400, 340, 3);
    m->move(100, 100);
    m->release(100, 100);
    QVERIFY(m->m_list->isAutoFilck());
    KSScrollBar* bar = m->m_list->getVScrollBar();
    QTest::touchEvent(bar, m_device).press(0, bar->handleRect().center());
    QVERIFY(!m->m_list->isAutoFilck());
    QTest::touchEvent(bar, m_device).release(0, bar->handleRect().center());
    QCOMPARE(m->clock.running(), 0);
}

QTEST_MAIN(tst_ksscrollviewerwidget)
#include "tst_ksscrollviewerwidget.moc"

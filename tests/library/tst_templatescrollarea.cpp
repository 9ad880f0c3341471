// One finger on a grid of buttons: taps, drags, flicks, and what further fingers may not do.
#include "library/TemplateScrollArea.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"

#include <QGridLayout>
#include <QPushButton>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>
#include <QWheelEvent>
#include <memory>

namespace
{

constexpr int COLUMNS = 4;
constexpr int ROWS = 20;
constexpr QSize BUTTON(100, 80);

} // namespace

class tst_templatescrollarea : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        mArea = std::make_unique<TemplateScrollArea>();
        auto* board = new QWidget;
        auto* grid = new QGridLayout(board);
        grid->setContentsMargins(0, 0, 0, 0);
        grid->setSpacing(0);
        grid->setSizeConstraint(QLayout::SetFixedSize);
        mButtons.clear();
        for (int i = 0; i < COLUMNS * ROWS; ++i) {
            auto* button = new QPushButton;
            button->setFixedSize(BUTTON);
            button->setAttribute(Qt::WA_AcceptTouchEvents);
            button->installEventFilter(mArea.get());
            grid->addWidget(button, i / COLUMNS, i % COLUMNS);
            mButtons.append(button);
        }
        mArea->setWidget(board);
        mArea->setFixedSize(460, 400);
        mArea->initTouch();
        mArea->show();
        QVERIFY(QTest::qWaitForWindowExposed(mArea.get(), PATIENCE_MS));
        QCOMPARE(mArea->verticalScrollBar()->maximum(), ROWS * BUTTON.height() - 400);
        mPressed = std::make_unique<QSignalSpy>(mArea.get(), &TemplateScrollArea::itemPressed);
    }

    void aTap()
    {
        touch().press(0, QPoint(150, 100));
        touch().release(0, QPoint(150, 100));
        QCOMPARE(mPressed->size(), 1);
        QCOMPARE(pressed(0), mButtons[5]);
        QCOMPARE(value(), 0);
    }

    void aTapBesideTheButtons()
    {
        touch().press(0, QPoint(430, 100));
        touch().release(0, QPoint(430, 100));
        QVERIFY(mPressed->isEmpty());
    }

    void farAsATapMayStray_data()
    {
        QTest::addColumn<QPoint>("way");
        QTest::addColumn<bool>("isTap");
        QTest::newRow("20 across") << QPoint(20, 0) << true;
        QTest::newRow("21 across") << QPoint(21, 0) << false;
        QTest::newRow("10 and 10") << QPoint(10, -10) << true;
        QTest::newRow("11 and 10") << QPoint(-11, 10) << false;
    }

    void farAsATapMayStray()
    {
        QFETCH(QPoint, way);
        QFETCH(bool, isTap);
        const QPoint start(150, 100);
        touch().press(0, start);
        touch().move(0, start + way);
        touch().move(0, start);
        touch().release(0, start);
        QCOMPARE(mPressed->size(), isTap ? 1 : 0);
        // The same with no update between.
        mArea->stopFlick();
        touch().press(0, start);
        touch().release(0, start + way);
        QCOMPARE(mPressed->size(), isTap ? 2 : 0);
    }

    void aDragFollowsTheFinger()
    {
        touch().press(0, QPoint(150, 300));
        touch().move(0, QPoint(150, 298)); // where the drag starts
        touch().move(0, QPoint(150, 98));
        QTRY_VERIFY(value() >= 190);
        QTRY_VERIFY(mArea->isFlickEnd());
        QVERIFY(value() <= 200);
        // Back to where it came from, held still, and lifted: no flick.
        touch().move(0, QPoint(150, 298));
        QTRY_VERIFY(value() <= 10);
        QTRY_VERIFY(mArea->isFlickEnd());
        touch().release(0, QPoint(150, 298));
        const int rest = value();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), rest);
        QVERIFY(mPressed->isEmpty());
    }

    void aFlickRunsOnAndDiesAtTheEnd()
    {
        mArea->verticalScrollBar()->setValue(mArea->verticalScrollBar()->maximum() - 60);
        flickUp();
        QTRY_COMPARE(value(), mArea->verticalScrollBar()->maximum());
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), mArea->verticalScrollBar()->maximum());
        // The grid is not in flight any more: the next finger taps.
        tap(QPoint(150, 100));
        QCOMPARE(mPressed->size(), 1);
    }

    void aFlickComesToRest()
    {
        touch().press(0, QPoint(150, 300));
        touch().move(0, QPoint(150, 290));
        touch().move(0, QPoint(150, 260));
        touch().release(0, QPoint(150, 260));
        QTRY_VERIFY(value() > 0);
        const int after = value();
        QTRY_VERIFY(value() > after);
        QTRY_VERIFY(mArea->isFlickEnd());
        QVERIFY(value() < mArea->verticalScrollBar()->maximum());
    }

    void aFingerThatStopsAFlickTapsNothing()
    {
        flickUp();
        QTRY_VERIFY(value() > 0);
        touch().press(0, QPoint(150, 100));
        const int braked = value();
        touch().release(0, QPoint(150, 100));
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), braked);
        QVERIFY(mPressed->isEmpty());
        tap(QPoint(150, 100));
        QCOMPARE(mPressed->size(), 1);
    }

    void aSecondFingerDoesNothing()
    {
        touch().press(0, QPoint(150, 300));
        touch().move(0, QPoint(150, 300)).press(1, QPoint(250, 300));
        touch().move(0, QPoint(150, 300)).move(1, QPoint(250, 200));
        touch().move(0, QPoint(150, 300)).move(1, QPoint(250, 100));
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), 0);
        touch().move(0, QPoint(150, 300)).release(1, QPoint(250, 100));
        QVERIFY(mPressed->isEmpty());
        touch().release(0, QPoint(150, 300));
        QCOMPARE(mPressed->size(), 1);
        QCOMPARE(pressed(0), mButtons[3 * COLUMNS + 1]);
    }

    // The first finger lifts while a second one on the same button stays.
    void theFirstFingerLiftsFirst()
    {
        touch().press(0, QPoint(150, 100));
        touch().move(0, QPoint(150, 100)).press(1, QPoint(160, 100));
        touch().release(0, QPoint(150, 100)).move(1, QPoint(160, 100));
        QCOMPARE(mPressed->size(), 1);
        touch().move(1, QPoint(160, 10));
        touch().release(1, QPoint(160, 10));
        QCOMPARE(mPressed->size(), 1);
        QCOMPARE(value(), 0);
        tap(QPoint(150, 100));
        QCOMPARE(mPressed->size(), 2);
    }

    void aCancelledTouchTapsNothing()
    {
        touch().press(0, QPoint(150, 100));
        QTouchEvent cancel(QEvent::TouchCancel, mDevice);
        QCoreApplication::sendEvent(mButtons[5], &cancel);
        touch().release(0, QPoint(150, 100));
        QVERIFY(mPressed->isEmpty());
        tap(QPoint(150, 100));
        QCOMPARE(mPressed->size(), 1);
    }

    // As when a dialog took it.
    void aTouchAfterOneWithoutAnEnd()
    {
        touch().press(0, QPoint(150, 100));
        QTouchEvent again(QEvent::TouchBegin, mDevice, Qt::NoModifier,
                          {QEventPoint(1, QEventPoint::Pressed, QPointF(30, 30),
                                       mButtons[5]->mapToGlobal(QPointF(30, 30)))});
        QCoreApplication::sendEvent(mButtons[5], &again);
        QTouchEvent end(QEvent::TouchEnd, mDevice, Qt::NoModifier,
                        {QEventPoint(1, QEventPoint::Released, QPointF(30, 30),
                                     mButtons[5]->mapToGlobal(QPointF(30, 30)))});
        QCoreApplication::sendEvent(mButtons[5], &end);
        QCOMPARE(mPressed->size(), 1);
        QCOMPARE(pressed(0), mButtons[5]);
        touch().release(0, QPoint(150, 100));
        QCOMPARE(mPressed->size(), 1);
    }

    // Its end never comes then.
    void theTouchedButtonGoes()
    {
        touch().press(0, QPoint(150, 100));
        delete mButtons[5];
        touch().release(0, QPoint(150, 100));
        QVERIFY(mPressed->isEmpty());
        tap(QPoint(50, 100));
        QCOMPARE(mPressed->size(), 1);
        QCOMPARE(pressed(0), mButtons[4]);
    }

    void hidingEndsTheMotion()
    {
        flickUp();
        QTRY_VERIFY(value() > 0);
        mArea->hide();
        const int hidden = value();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), hidden);
    }

    void theWheelStopsAFlick()
    {
        flickUp();
        QTRY_VERIFY(value() > 0);
        const int before = value();
        QWheelEvent wheel(QPointF(5, 5), mArea->verticalScrollBar()->mapToGlobal(QPointF(5, 5)), QPoint(),
                          QPoint(0, 120), Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(mArea->verticalScrollBar(), &wheel);
        QVERIFY(value() < before);
        const int after = value();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), after);
    }

    void aGridThatFitsDoesNotMove()
    {
        for (int i = 2 * COLUMNS; i < mButtons.size(); ++i)
            delete mButtons[i];
        QTRY_COMPARE(mArea->verticalScrollBar()->maximum(), 0);
        flickUp();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), 0);
        tap(QPoint(150, 100));
        QCOMPARE(mPressed->size(), 1);
    }

private:
    QTest::QTouchEventWidgetSequence touch() { return QTest::touchEvent(mArea.get(), mDevice); }

    void tap(const QPoint& point)
    {
        touch().press(0, point);
        touch().release(0, point);
    }

    void flickUp()
    {
        touch().press(0, QPoint(150, 300));
        touch().move(0, QPoint(150, 290));
        touch().move(0, QPoint(150, 60));
        touch().release(0, QPoint(150, 60));
    }

    QPushButton* pressed(int index) const { return mPressed->at(index).at(0).value<QPushButton*>(); }
    int value() const { return mArea->verticalScrollBar()->value(); }

    TouchDevice mDevice;
    std::unique_ptr<TemplateScrollArea> mArea;
    std::unique_ptr<QSignalSpy> mPressed;
    QList<QPushButton*> mButtons;
};

QTEST_MAIN(tst_templatescrollarea)
#include "tst_templatescrollarea.moc"

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
        m_area = std::make_unique<TemplateScrollArea>();
        auto* board = new QWidget;
        auto* grid = new QGridLayout(board);
        grid->setContentsMargins(0, 0, 0, 0);
        grid->setSpacing(0);
        grid->setSizeConstraint(QLayout::SetFixedSize);
        m_buttons.clear();
        for (int i = 0; i < COLUMNS * ROWS; ++i) {
            auto* button = new QPushButton;
            button->setFixedSize(BUTTON);
            button->setAttribute(Qt::WA_AcceptTouchEvents);
            button->installEventFilter(m_area.get());
            grid->addWidget(button, i / COLUMNS, i % COLUMNS);
            m_buttons.append(button);
        }
        m_area->setWidget(board);
        m_area->setFixedSize(460, 400);
        m_area->initTouch();
        m_area->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_area.get(), PATIENCE_MS));
        QCOMPARE(m_area->verticalScrollBar()->maximum(), ROWS * BUTTON.height() - 400);
        m_pressed = std::make_unique<QSignalSpy>(m_area.get(), &TemplateScrollArea::itemPressed);
    }

    void aTap()
    {
        touch().press(0, QPoint(150, 100));
        touch().release(0, QPoint(150, 100));
        QCOMPARE(m_pressed->size(), 1);
        QCOMPARE(pressed(0), m_buttons[5]);
        QCOMPARE(value(), 0);
    }

    void aTapBesideTheButtons()
    {
        touch().press(0, QPoint(430, 100));
        touch().release(0, QPoint(430, 100));
        QVERIFY(m_pressed->isEmpty());
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
        QCOMPARE(m_pressed->size(), isTap ? 1 : 0);
        // The same without an update between begin and end.
        m_area->stopFlick();
        touch().press(0, start);
        touch().release(0, start + way);
        QCOMPARE(m_pressed->size(), isTap ? 2 : 0);
    }

    void aDragFollowsTheFinger()
    {
        touch().press(0, QPoint(150, 300));
        touch().move(0, QPoint(150, 298)); // where the drag starts
        touch().move(0, QPoint(150, 98));
        QTRY_VERIFY(value() >= 190);
        QTRY_VERIFY(m_area->isFlickEnd());
        QVERIFY(value() <= 200);
        // A finger that returns, rests and lifts does not start a flick.
        touch().move(0, QPoint(150, 298));
        QTRY_VERIFY(value() <= 10);
        QTRY_VERIFY(m_area->isFlickEnd());
        touch().release(0, QPoint(150, 298));
        const int rest = value();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), rest);
        QVERIFY(m_pressed->isEmpty());
    }

    void aFlickRunsOnAndDiesAtTheEnd()
    {
        m_area->verticalScrollBar()->setValue(m_area->verticalScrollBar()->maximum() - 60);
        flickUp();
        QTRY_COMPARE(value(), m_area->verticalScrollBar()->maximum());
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), m_area->verticalScrollBar()->maximum());
        // The grid does not move any more, so the next touch is a tap.
        tap(QPoint(150, 100));
        QCOMPARE(m_pressed->size(), 1);
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
        QTRY_VERIFY(m_area->isFlickEnd());
        QVERIFY(value() < m_area->verticalScrollBar()->maximum());
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
        QVERIFY(m_pressed->isEmpty());
        tap(QPoint(150, 100));
        QCOMPARE(m_pressed->size(), 1);
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
        QVERIFY(m_pressed->isEmpty());
        touch().release(0, QPoint(150, 300));
        QCOMPARE(m_pressed->size(), 1);
        QCOMPARE(pressed(0), m_buttons[3 * COLUMNS + 1]);
    }

    // The first finger lifts while a second one on the same button stays.
    void theFirstFingerLiftsFirst()
    {
        touch().press(0, QPoint(150, 100));
        touch().move(0, QPoint(150, 100)).press(1, QPoint(160, 100));
        touch().release(0, QPoint(150, 100)).move(1, QPoint(160, 100));
        QCOMPARE(m_pressed->size(), 1);
        touch().move(1, QPoint(160, 10));
        touch().release(1, QPoint(160, 10));
        QCOMPARE(m_pressed->size(), 1);
        QCOMPARE(value(), 0);
        tap(QPoint(150, 100));
        QCOMPARE(m_pressed->size(), 2);
    }

    void aCancelledTouchTapsNothing()
    {
        touch().press(0, QPoint(150, 100));
        QTouchEvent cancel(QEvent::TouchCancel, m_device);
        QCoreApplication::sendEvent(m_buttons[5], &cancel);
        touch().release(0, QPoint(150, 100));
        QVERIFY(m_pressed->isEmpty());
        tap(QPoint(150, 100));
        QCOMPARE(m_pressed->size(), 1);
    }

    // The end of the first touch is missing, as when a dialog opens.
    void aTouchAfterOneWithoutAnEnd()
    {
        touch().press(0, QPoint(150, 100));
        QTouchEvent again(QEvent::TouchBegin, m_device, Qt::NoModifier,
                          {QEventPoint(1, QEventPoint::Pressed, QPointF(30, 30),
                                       m_buttons[5]->mapToGlobal(QPointF(30, 30)))});
        QCoreApplication::sendEvent(m_buttons[5], &again);
        QTouchEvent end(QEvent::TouchEnd, m_device, Qt::NoModifier,
                        {QEventPoint(1, QEventPoint::Released, QPointF(30, 30),
                                     m_buttons[5]->mapToGlobal(QPointF(30, 30)))});
        QCoreApplication::sendEvent(m_buttons[5], &end);
        QCOMPARE(m_pressed->size(), 1);
        QCOMPARE(pressed(0), m_buttons[5]);
        touch().release(0, QPoint(150, 100));
        QCOMPARE(m_pressed->size(), 1);
    }

    // A touch whose button is destroyed never gets its end.
    void theTouchedButtonGoes()
    {
        touch().press(0, QPoint(150, 100));
        delete m_buttons[5];
        touch().release(0, QPoint(150, 100));
        QVERIFY(m_pressed->isEmpty());
        tap(QPoint(50, 100));
        QCOMPARE(m_pressed->size(), 1);
        QCOMPARE(pressed(0), m_buttons[4]);
    }

    void hidingEndsTheMotion()
    {
        flickUp();
        QTRY_VERIFY(value() > 0);
        m_area->hide();
        const int hidden = value();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), hidden);
    }

    void theWheelStopsAFlick()
    {
        flickUp();
        QTRY_VERIFY(value() > 0);
        const int before = value();
        QWheelEvent wheel(QPointF(5, 5), m_area->verticalScrollBar()->mapToGlobal(QPointF(5, 5)), QPoint(),
                          QPoint(0, 120), Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(m_area->verticalScrollBar(), &wheel);
        QVERIFY(value() < before);
        const int after = value();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), after);
    }

    void aGridThatFitsDoesNotMove()
    {
        for (int i = 2 * COLUMNS; i < m_buttons.size(); ++i)
            delete m_buttons[i];
        QTRY_COMPARE(m_area->verticalScrollBar()->maximum(), 0);
        flickUp();
        QTest::qWait(3 * TemplateScrollArea::TOUCH_TIMER_TIME);
        QCOMPARE(value(), 0);
        tap(QPoint(150, 100));
        QCOMPARE(m_pressed->size(), 1);
    }

private:
    QTest::QTouchEventWidgetSequence touch() { return QTest::touchEvent(m_area.get(), m_device); }

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

    QPushButton* pressed(int index) const { return m_pressed->at(index).at(0).value<QPushButton*>(); }
    int value() const { return m_area->verticalScrollBar()->value(); }

    TouchDevice m_device;
    std::unique_ptr<TemplateScrollArea> m_area;
    std::unique_ptr<QSignalSpy> m_pressed;
    QList<QPushButton*> m_buttons;
};

QTEST_MAIN(tst_templatescrollarea)
#include "tst_templatescrollarea.moc"

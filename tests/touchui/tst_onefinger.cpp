// One finger on a widget: what it makes of touch events, and everything that takes the finger away.
#include "TouchFixture.h"
#include "tests/fakes/ManualClock.h"

#include "tests/support/Patience.h"
#include "touchui/OneFinger.h"

#include <QSignalSpy>
#include <QTest>
#include <QTouchEvent>
#include <functional>

namespace
{

using Step = OneFinger::Step;

// Follows a finger on itself and on its child.
class Pad : public QWidget
{
public:
    Pad() : child(new QWidget(this))
    {
        setAttribute(Qt::WA_AcceptTouchEvents);
        child->setAttribute(Qt::WA_AcceptTouchEvents);
        child->installEventFilter(this);
        child->setGeometry(100, 0, 100, 100);
        resize(200, 100);
    }
    bool event(QEvent* event) override { return follow(event, nullptr) || QWidget::event(event); }
    bool eventFilter(QObject* object, QEvent* event) override { return follow(event, object); }
    QList<Step> take() { return std::exchange(steps, {}); }

    QWidget* child;
    OneFinger finger{this};
    QList<Step> steps;

private:
    bool follow(QEvent* event, QObject* receiver)
    {
        switch (event->type()) {
        case QEvent::TouchBegin:
        case QEvent::TouchUpdate:
        case QEvent::TouchEnd:
        case QEvent::TouchCancel:
            steps.append(finger.follow(static_cast<QTouchEvent*>(event), receiver));
            event->accept();
            return true;
        default:
            return false;
        }
    }
};

} // namespace

class tst_onefinger : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_touch = std::make_unique<TouchFixture>();
        m_pad = std::make_unique<Pad>();
        m_pad->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_pad.get(), PATIENCE_MS));
        m_cancelled = std::make_unique<QSignalSpy>(&m_pad->finger, &OneFinger::cancelled);
    }
    void cleanup()
    {
        m_pad.reset();
        m_touch.reset();
    }

    void aTouch()
    {
        m_touch->press(m_pad.get(), QPoint(20, 30));
        QVERIFY(m_pad->finger.isDown());
        QCOMPARE(m_pad->finger.receiver(), m_pad.get());
        m_touch->move(m_pad.get(), QPoint(25, 35));
        QCOMPARE(m_pad->finger.positionIn(m_pad.get()), QPointF(25, 35));
        QCOMPARE(m_pad->finger.pressPosition(), m_pad->mapToGlobal(QPointF(20, 30)));
        m_touch->lift(m_pad.get(), QPoint(26, 36));
        QVERIFY(!m_pad->finger.isDown());
        QCOMPARE(m_pad->finger.id(), -1);
        QVERIFY(!m_pad->finger.receiver());
        QCOMPARE(m_pad->finger.positionIn(m_pad.get()), QPointF(26, 36));
        QCOMPARE(m_pad->take(), (QList<Step>{Step::Begin, Step::Move, Step::End}));
        QCOMPARE(m_cancelled->count(), 0);
    }

    void furtherFingersAreIgnored()
    {
        auto fingers = QTest::touchEvent(m_pad.get(), m_touch->device(), false);
        fingers.press(0, QPoint(20, 30)).commit();
        fingers.stationary(0).press(1, QPoint(60, 30)).commit();
        fingers.move(0, QPoint(22, 30)).move(1, QPoint(80, 30)).commit();
        QCOMPARE(m_pad->finger.positionIn(m_pad.get()), QPointF(22, 30));
        fingers.release(0, QPoint(22, 30)).stationary(1).commit();
        QVERIFY(!m_pad->finger.isDown());
        fingers.move(1, QPoint(90, 30)).commit();
        fingers.release(1, QPoint(90, 30)).commit();
        QCOMPARE(m_pad->take(),
                 (QList<Step>{Step::Begin, Step::Move, Step::Move, Step::End, Step::None, Step::None}));
    }

    void aBeginStartsAnew()
    {
        m_touch->press(m_pad.get(), QPoint(20, 30));
        QTouchEvent again(
            QEvent::TouchBegin, m_touch->device(), Qt::NoModifier,
            {QEventPoint(7, QEventPoint::Pressed, QPointF(40, 30), m_pad->mapToGlobal(QPointF(40, 30)))});
        QCoreApplication::sendEvent(m_pad.get(), &again);
        QCOMPARE(m_cancelled->count(), 1);
        QCOMPARE(m_pad->finger.id(), 7);
        QCOMPARE(m_pad->finger.positionIn(m_pad.get()), QPointF(40, 30));
        QCOMPARE(m_pad->take(), (QList<Step>{Step::Begin, Step::Begin}));
    }

    void anEndWithoutTheFingerCancels()
    {
        m_touch->press(m_pad.get(), QPoint(20, 30));
        QTouchEvent end(
            QEvent::TouchEnd, m_touch->device(), Qt::NoModifier,
            {QEventPoint(7, QEventPoint::Released, QPointF(40, 30), m_pad->mapToGlobal(QPointF(40, 30)))});
        QCoreApplication::sendEvent(m_pad.get(), &end);
        QCOMPARE(m_cancelled->count(), 1);
        QVERIFY(!m_pad->finger.isDown());
    }

    void whatTakesTheFingerAway_data()
    {
        QTest::addColumn<bool>("onTheChild");
        QTest::addColumn<std::function<void()>>("end");
        const auto rows = [](const char* name, std::function<void()> end) {
            QTest::addRow("%s", name) << false << end;
            QTest::addRow("%s, on a child", name) << true << end;
        };
        rows("an event", [this] { m_touch->cancel(qobject_cast<QWidget*>(m_pad->finger.receiver())); });
        rows("its owner", [this] { m_pad->finger.cancel(); });
        rows("hiding", [this] { m_pad->hide(); });
        rows("disabling", [this] { m_pad->setEnabled(false); });
        rows("an unlock", [this] { m_touch->filter->unlock(); });
        QTest::newRow("destruction of the child")
            << true << std::function<void()>([this] { delete std::exchange(m_pad->child, nullptr); });
    }

    void whatTakesTheFingerAway()
    {
        QFETCH(bool, onTheChild);
        QFETCH(std::function<void()>, end);
        ManualClock clock;
        QSignalSpy held(&m_pad->finger, &OneFinger::held);
        m_touch->press(onTheChild ? m_pad->child : m_pad.get(), QPoint(20, 30));
        QCOMPARE(m_pad->finger.receiver(), onTheChild ? m_pad->child : m_pad.get());
        m_pad->finger.startHold(700);
        end();
        QVERIFY(!m_pad->finger.isDown());
        QVERIFY(!m_pad->finger.receiver());
        QVERIFY(!m_touch->isLocked());
        QCoreApplication::processEvents();
        QCOMPARE(m_cancelled->count(), 1);
        clock.advance(20000);
        QCOMPARE(held.count(), 0);
        QCOMPARE(m_cancelled->count(), 1);
        m_pad->setEnabled(true);
        m_pad->show();
        m_touch->lift(m_pad.get(), QPoint(20, 30));
        m_pad->take();
        m_touch->tap(m_pad.get(), QPoint(20, 30));
        QCOMPARE(m_pad->take(), (QList<Step>{Step::Begin, Step::End}));
    }

    void theHold()
    {
        ManualClock clock;
        QSignalSpy held(&m_pad->finger, &OneFinger::held);
        m_touch->press(m_pad.get(), QPoint(20, 30));
        m_pad->finger.startHold(700);
        clock.advance(699);
        QCOMPARE(held.count(), 0);
        m_pad->finger.restartHold();
        clock.advance(699);
        QCOMPARE(held.count(), 0);
        clock.advance(1);
        QCOMPARE(held.count(), 1);
        m_pad->finger.startHold(700);
        m_touch->lift(m_pad.get(), QPoint(20, 30));
        clock.advance(2000);
        QCOMPARE(held.count(), 1);
        m_pad->finger.startHold(700); // the mouse presses
        m_pad->hide();
        clock.advance(2000);
        QCOMPARE(held.count(), 1);
        QCOMPARE(m_cancelled->count(), 1);
    }

    void whatTheFingerDoesIsReported()
    {
        QList<QEvent::Type> acted;
        connect(&m_pad->finger, &OneFinger::acted, this, [&](QEvent::Type type) { acted.append(type); });
        QSignalSpy began(&m_pad->finger, &OneFinger::began);
        QSignalSpy moved(&m_pad->finger, &OneFinger::moved);
        QSignalSpy lifted(&m_pad->finger, &OneFinger::lifted);
        m_touch->press(m_pad.get(), QPoint(20, 30));
        m_touch->move(m_pad.get(), QPoint(25, 30));
        m_touch->lift(m_pad.get(), QPoint(25, 30));
        QCOMPARE(acted, (QList<QEvent::Type>{QEvent::MouseButtonPress, QEvent::MouseMove,
                                             QEvent::MouseButtonRelease}));
        QCOMPARE(began.count(), 1);
        QCOMPARE(moved.count(), 1);
        QCOMPARE(lifted.count(), 1);
        m_touch->press(m_pad.get(), QPoint(20, 30));
        m_pad->finger.cancel();
        QCOMPARE(lifted.count(), 1);
        QCOMPARE(acted.size(), 4);
    }

    void aReceiverMayDestroyTheWidget()
    {
        connect(&m_pad->finger, &OneFinger::lifted, this, [this] { m_pad.reset(); });
        QTouchEvent begin(QEvent::TouchBegin, m_touch->device(), Qt::NoModifier,
                          {QEventPoint(1, QEventPoint::Pressed, QPointF(40, 30), QPointF(40, 30))});
        QVERIFY(m_pad->finger.takes(&begin));
        QTouchEvent end(QEvent::TouchEnd, m_touch->device(), Qt::NoModifier,
                        {QEventPoint(1, QEventPoint::Released, QPointF(40, 30), QPointF(40, 30))});
        QVERIFY(m_pad->finger.takes(&end));
        QVERIFY(m_pad == nullptr);
    }

    void otherEventsAreNotTaken()
    {
        QEvent event(QEvent::MouseMove);
        QVERIFY(!m_pad->finger.takes(&event));
    }

    void aFingerIsTheLeftButton_data()
    {
        QTest::addColumn<int>("type");
        QTest::addColumn<int>("button");
        QTest::addColumn<int>("buttons");
        QTest::newRow("press") << int(QEvent::MouseButtonPress) << int(Qt::LeftButton) << int(Qt::LeftButton);
        QTest::newRow("move") << int(QEvent::MouseMove) << int(Qt::NoButton) << int(Qt::LeftButton);
        QTest::newRow("lift") << int(QEvent::MouseButtonRelease) << int(Qt::LeftButton) << int(Qt::NoButton);
    }

    void aFingerIsTheLeftButton()
    {
        QFETCH(int, type);
        const QMouseEvent event = OneFinger::mouseEvent(QEvent::Type(type), QPointF(3, 4), QPointF(103, 204));
        QCOMPARE(int(event.type()), type);
        QTEST(int(event.button()), "button");
        QTEST(int(event.buttons().toInt()), "buttons");
        QCOMPARE(event.position(), QPointF(3, 4));
        QCOMPARE(event.globalPosition(), QPointF(103, 204));
    }

    void aDisabledWidgetHasNoFinger()
    {
        m_pad->setEnabled(false);
        QTouchEvent begin(QEvent::TouchBegin, m_touch->device(), Qt::NoModifier,
                          {QEventPoint(1, QEventPoint::Pressed, QPointF(40, 30), QPointF(40, 30))});
        QCOMPARE(m_pad->finger.follow(&begin), Step::None);
        QVERIFY(!m_pad->finger.isDown());
    }

private:
    std::unique_ptr<TouchFixture> m_touch;
    std::unique_ptr<Pad> m_pad;
    std::unique_ptr<QSignalSpy> m_cancelled;
};

QTEST_MAIN(tst_onefinger)
#include "tst_onefinger.moc"

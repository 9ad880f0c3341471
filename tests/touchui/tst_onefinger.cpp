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
        mTouch = std::make_unique<TouchFixture>();
        mPad = std::make_unique<Pad>();
        mPad->show();
        QVERIFY(QTest::qWaitForWindowExposed(mPad.get(), PATIENCE_MS));
        mCancelled = std::make_unique<QSignalSpy>(&mPad->finger, &OneFinger::cancelled);
    }
    void cleanup()
    {
        mPad.reset();
        mTouch.reset();
    }

    void aTouch()
    {
        mTouch->press(mPad.get(), QPoint(20, 30));
        QVERIFY(mPad->finger.isDown());
        QCOMPARE(mPad->finger.receiver(), mPad.get());
        mTouch->move(mPad.get(), QPoint(25, 35));
        QCOMPARE(mPad->finger.positionIn(mPad.get()), QPointF(25, 35));
        QCOMPARE(mPad->finger.pressPosition(), mPad->mapToGlobal(QPointF(20, 30)));
        mTouch->lift(mPad.get(), QPoint(26, 36));
        QVERIFY(!mPad->finger.isDown());
        QCOMPARE(mPad->finger.id(), -1);
        QVERIFY(!mPad->finger.receiver());
        QCOMPARE(mPad->finger.positionIn(mPad.get()), QPointF(26, 36));
        QCOMPARE(mPad->take(), (QList<Step>{Step::Begin, Step::Move, Step::End}));
        QCOMPARE(mCancelled->count(), 0);
    }

    void furtherFingersAreIgnored()
    {
        auto fingers = QTest::touchEvent(mPad.get(), mTouch->device(), false);
        fingers.press(0, QPoint(20, 30)).commit();
        fingers.stationary(0).press(1, QPoint(60, 30)).commit();
        fingers.move(0, QPoint(22, 30)).move(1, QPoint(80, 30)).commit();
        QCOMPARE(mPad->finger.positionIn(mPad.get()), QPointF(22, 30));
        fingers.release(0, QPoint(22, 30)).stationary(1).commit();
        QVERIFY(!mPad->finger.isDown());
        fingers.move(1, QPoint(90, 30)).commit();
        fingers.release(1, QPoint(90, 30)).commit();
        QCOMPARE(mPad->take(),
                 (QList<Step>{Step::Begin, Step::Move, Step::Move, Step::End, Step::None, Step::None}));
    }

    void aBeginStartsAnew()
    {
        mTouch->press(mPad.get(), QPoint(20, 30));
        QTouchEvent again(
            QEvent::TouchBegin, mTouch->device(), Qt::NoModifier,
            {QEventPoint(7, QEventPoint::Pressed, QPointF(40, 30), mPad->mapToGlobal(QPointF(40, 30)))});
        QCoreApplication::sendEvent(mPad.get(), &again);
        QCOMPARE(mCancelled->count(), 1);
        QCOMPARE(mPad->finger.id(), 7);
        QCOMPARE(mPad->finger.positionIn(mPad.get()), QPointF(40, 30));
        QCOMPARE(mPad->take(), (QList<Step>{Step::Begin, Step::Begin}));
    }

    void anEndWithoutTheFingerCancels()
    {
        mTouch->press(mPad.get(), QPoint(20, 30));
        QTouchEvent end(
            QEvent::TouchEnd, mTouch->device(), Qt::NoModifier,
            {QEventPoint(7, QEventPoint::Released, QPointF(40, 30), mPad->mapToGlobal(QPointF(40, 30)))});
        QCoreApplication::sendEvent(mPad.get(), &end);
        QCOMPARE(mCancelled->count(), 1);
        QVERIFY(!mPad->finger.isDown());
    }

    void whatTakesTheFingerAway_data()
    {
        QTest::addColumn<bool>("onTheChild");
        QTest::addColumn<std::function<void()>>("end");
        const auto rows = [](const char* name, std::function<void()> end) {
            QTest::addRow("%s", name) << false << end;
            QTest::addRow("%s, on a child", name) << true << end;
        };
        rows("an event", [this] { mTouch->cancel(qobject_cast<QWidget*>(mPad->finger.receiver())); });
        rows("its owner", [this] { mPad->finger.cancel(); });
        rows("hiding", [this] { mPad->hide(); });
        rows("disabling", [this] { mPad->setEnabled(false); });
        rows("an unlock", [this] { mTouch->filter->unlock(); });
        QTest::newRow("destruction of the child")
            << true << std::function<void()>([this] { delete std::exchange(mPad->child, nullptr); });
    }

    void whatTakesTheFingerAway()
    {
        QFETCH(bool, onTheChild);
        QFETCH(std::function<void()>, end);
        ManualClock clock;
        QSignalSpy held(&mPad->finger, &OneFinger::held);
        mTouch->press(onTheChild ? mPad->child : mPad.get(), QPoint(20, 30));
        QCOMPARE(mPad->finger.receiver(), onTheChild ? mPad->child : mPad.get());
        mPad->finger.startHold(700);
        end();
        QVERIFY(!mPad->finger.isDown());
        QVERIFY(!mPad->finger.receiver());
        QVERIFY(!mTouch->isLocked());
        QCoreApplication::processEvents();
        QCOMPARE(mCancelled->count(), 1);
        clock.advance(20000);
        QCOMPARE(held.count(), 0);
        QCOMPARE(mCancelled->count(), 1);
        mPad->setEnabled(true);
        mPad->show();
        mTouch->lift(mPad.get(), QPoint(20, 30));
        mPad->take();
        mTouch->tap(mPad.get(), QPoint(20, 30));
        QCOMPARE(mPad->take(), (QList<Step>{Step::Begin, Step::End}));
    }

    void theHold()
    {
        ManualClock clock;
        QSignalSpy held(&mPad->finger, &OneFinger::held);
        mTouch->press(mPad.get(), QPoint(20, 30));
        mPad->finger.startHold(700);
        clock.advance(699);
        QCOMPARE(held.count(), 0);
        mPad->finger.restartHold();
        clock.advance(699);
        QCOMPARE(held.count(), 0);
        clock.advance(1);
        QCOMPARE(held.count(), 1);
        mPad->finger.startHold(700);
        mTouch->lift(mPad.get(), QPoint(20, 30));
        clock.advance(2000);
        QCOMPARE(held.count(), 1);
        mPad->finger.startHold(700); // the mouse presses
        mPad->hide();
        clock.advance(2000);
        QCOMPARE(held.count(), 1);
        QCOMPARE(mCancelled->count(), 1);
    }

    void whatTheFingerDoesIsReported()
    {
        QList<QEvent::Type> acted;
        connect(&mPad->finger, &OneFinger::acted, this, [&](QEvent::Type type) { acted.append(type); });
        QSignalSpy began(&mPad->finger, &OneFinger::began);
        QSignalSpy moved(&mPad->finger, &OneFinger::moved);
        QSignalSpy lifted(&mPad->finger, &OneFinger::lifted);
        mTouch->press(mPad.get(), QPoint(20, 30));
        mTouch->move(mPad.get(), QPoint(25, 30));
        mTouch->lift(mPad.get(), QPoint(25, 30));
        QCOMPARE(acted, (QList<QEvent::Type>{QEvent::MouseButtonPress, QEvent::MouseMove,
                                             QEvent::MouseButtonRelease}));
        QCOMPARE(began.count(), 1);
        QCOMPARE(moved.count(), 1);
        QCOMPARE(lifted.count(), 1);
        mTouch->press(mPad.get(), QPoint(20, 30));
        mPad->finger.cancel();
        QCOMPARE(lifted.count(), 1);
        QCOMPARE(acted.size(), 4);
    }

    void aReceiverMayDestroyTheWidget()
    {
        connect(&mPad->finger, &OneFinger::lifted, this, [this] { mPad.reset(); });
        QTouchEvent begin(QEvent::TouchBegin, mTouch->device(), Qt::NoModifier,
                          {QEventPoint(1, QEventPoint::Pressed, QPointF(40, 30), QPointF(40, 30))});
        QVERIFY(mPad->finger.takes(&begin));
        QTouchEvent end(QEvent::TouchEnd, mTouch->device(), Qt::NoModifier,
                        {QEventPoint(1, QEventPoint::Released, QPointF(40, 30), QPointF(40, 30))});
        QVERIFY(mPad->finger.takes(&end));
        QVERIFY(mPad == nullptr);
    }

    void otherEventsAreNotTaken()
    {
        QEvent event(QEvent::MouseMove);
        QVERIFY(!mPad->finger.takes(&event));
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
        mPad->setEnabled(false);
        QTouchEvent begin(QEvent::TouchBegin, mTouch->device(), Qt::NoModifier,
                          {QEventPoint(1, QEventPoint::Pressed, QPointF(40, 30), QPointF(40, 30))});
        QCOMPARE(mPad->finger.follow(&begin), Step::None);
        QVERIFY(!mPad->finger.isDown());
    }

private:
    std::unique_ptr<TouchFixture> mTouch;
    std::unique_ptr<Pad> mPad;
    std::unique_ptr<QSignalSpy> mCancelled;
};

QTEST_MAIN(tst_onefinger)
#include "tst_onefinger.moc"

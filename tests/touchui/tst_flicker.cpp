// One list that follows a finger, tick by tick.
#include "tests/fakes/ManualClock.h"
#include "touchui/Flicker.h"

#include <QScrollArea>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTest>

#include <memory>

namespace
{

constexpr int TICK = FlickMotion::Rules().interval;

// Scrolls as lists do, from the middle of a thousand pixels.
class List : public QScrollArea
{
public:
    explicit List(const FlickMotion::Rules& rules) : flicker(this, rules)
    {
        verticalScrollBar()->setRange(0, 1000);
        verticalScrollBar()->setValue(500);
        connect(&flicker, &Flicker::ticked, this, [this] {
            QScrollBar* bar = verticalScrollBar();
            bar->setValue(FlickMotion::scrolledValue(bar->value(), FlickMotion::pixels(flicker.advance()).y(),
                                                     bar->minimum(), bar->maximum()));
        });
        connect(&flicker, &Flicker::ended, this, [this](Flicker::End end) { ends.append(end); });
    }
    int value() const { return verticalScrollBar()->value(); }

    Flicker flicker;
    QList<Flicker::End> ends;
};

} // namespace

class tst_flicker : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void init() { m_clock = std::make_unique<ManualClock>(); }
    void cleanup() { m_clock.reset(); }

    void followsTheFingerAndRests()
    {
        List list(FlickMotion::scrollViewer());
        QSignalSpy started(&list.flicker, &Flicker::started);
        list.flicker.begin(QPointF(10, 100));
        QVERIFY(list.flicker.isFollowing());
        list.flicker.follow(QPointF(10, 110)); // where the motion starts from
        QVERIFY(!list.flicker.isRunning());
        list.flicker.follow(QPointF(10, 10));
        QCOMPARE(started.count(), 1);
        QVERIFY(list.flicker.hasFlicked());
        QVERIFY(list.flicker.isMove());
        m_clock->advance(TICK);
        QCOMPARE(list.value(), 550); // half of the way
        m_clock->advance(20 * TICK);
        QVERIFY(list.flicker.isEnd());
        QVERIFY(!list.flicker.isRunning());
        QCOMPARE(list.ends, QList<Flicker::End>{Flicker::End::Rest});
        QVERIFY(qAbs(list.value() - 600) <= 10);
        list.flicker.lift(QPointF(10, 10));
        QVERIFY(!list.flicker.isGliding());
        QCOMPARE(m_clock->running(), 0);
    }

    void firstMoveCountsWhereTheRulesSaySo()
    {
        List list(FlickMotion::comboList());
        list.flicker.begin(QPointF(10, 100));
        list.flicker.follow(QPointF(10, 60));
        QVERIFY(list.flicker.isRunning());
        m_clock->advance(TICK);
        QCOMPARE(list.value(), 520);
    }

    void glidesOnAndComesToRest()
    {
        List list(FlickMotion::scrollViewer());
        list.flicker.begin(QPointF(10, 100));
        list.flicker.follow(QPointF(10, 100));
        list.flicker.lift(QPointF(10, 70));
        QVERIFY(list.flicker.isGliding());
        QVERIFY(!list.flicker.isFollowing());
        m_clock->advance(1000 * TICK);
        QVERIFY(!list.flicker.isGliding());
        QCOMPARE(list.ends, QList<Flicker::End>{Flicker::End::Glide});
        QVERIFY(list.value() > 530);
        QCOMPARE(m_clock->running(), 0);
    }

    void glideDiesAtTheLimit()
    {
        List list(FlickMotion::treeView());
        list.flicker.begin(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 0));
        list.flicker.lift(QPointF(10, 400));
        m_clock->advance(1000 * TICK);
        QCOMPARE(list.value(), 0);
        QCOMPARE(list.ends, QList<Flicker::End>{Flicker::End::Limit});
        QVERIFY(!list.flicker.isRunning());
    }

    // A drag beyond the end goes on in some lists and stops in others.
    void dragAtTheLimit_data()
    {
        QTest::addColumn<bool>("viewer");
        QTest::newRow("viewer") << true;
        QTest::newRow("tree") << false;
    }

    void dragAtTheLimit()
    {
        QFETCH(bool, viewer);
        List list(viewer ? FlickMotion::scrollViewer() : FlickMotion::treeView());
        list.verticalScrollBar()->setValue(0);
        list.flicker.begin(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 400));
        m_clock->advance(TICK);
        QCOMPARE(list.value(), 0);
        QCOMPARE(list.flicker.isRunning(), !viewer);
        QCOMPARE(list.ends.contains(Flicker::End::Limit), viewer);
    }

    void boundedDragDoesNotGlide()
    {
        List list(FlickMotion::scrollViewer());
        list.flicker.begin(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 400));
        list.flicker.advance(FlickMotion::DragBounds{10, 59, 100});
        list.flicker.lift(QPointF(10, 400));
        QVERIFY(!list.flicker.isGliding());
        QVERIFY(!list.flicker.isRunning());
    }

    void withoutAbilityNothingMoves()
    {
        List list(FlickMotion::scrollViewer());
        list.flicker.begin(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 40));
        list.flicker.setAble(false);
        QVERIFY(!list.flicker.isRunning());
        list.flicker.follow(QPointF(10, 80));
        list.flicker.lift(QPointF(10, 80));
        QVERIFY(!list.flicker.isRunning());
        QVERIFY(!list.flicker.isGliding());
        list.flicker.begin(QPointF(10, 0));
        QVERIFY(list.flicker.isAble());
    }

    void cancelForgetsTheWay()
    {
        List list(FlickMotion::scrollViewer());
        list.flicker.begin(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 0));
        list.flicker.follow(QPointF(10, 40));
        list.flicker.cancel();
        QVERIFY(list.flicker.isEnd());
        QVERIFY(!list.flicker.isRunning());
        QVERIFY(!list.flicker.hasFlicked());
        list.flicker.follow(QPointF(10, 400));
        list.flicker.lift(QPointF(10, 400));
        QVERIFY(!list.flicker.isRunning());
        QVERIFY(list.ends.isEmpty());
    }

private:
    std::unique_ptr<ManualClock> m_clock;
};

QTEST_MAIN(tst_flicker)

#include "tst_flicker.moc"

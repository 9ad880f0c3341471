// The arithmetic of flicked and dragged lists, row by row.
#include "touchui/FlickMotion.h"

#include <QTest>

#include <limits>
#include <vector>

using namespace FlickMotion;

namespace
{

enum Kind { Viewer, Tree, Grid, Fonts };

Rules rulesOf(int kind)
{
    switch (kind) {
    case Tree:
        return treeView();
    case Grid:
        return templateGrid();
    case Fonts:
        return comboList();
    default:
        return scrollViewer();
    }
}

} // namespace

class tst_flickmotion : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void everyListTicksAlike();
    void endOfFlick_data();
    void endOfFlick();
    void dragTick_data();
    void dragTick();
    void flickTick_data();
    void flickTick();
    void bounds_data();
    void bounds();
    void boundedTickKeepsTheItemInside();
    void dragCoversTheWay();
    void flickGlidesAndRests();
    void treeCreepsOn();
    void scrolling_data();
    void scrolling();
    void limits();
    void slop_data();
    void slop();
    void move_data();
    void move();
    void dropping_data();
    void dropping();
    void edgeScrolling_data();
    void edgeScrolling();
    void sliding_data();
    void sliding();
    void nonsense();
};

void tst_flickmotion::everyListTicksAlike()
{
    for (int kind : {Viewer, Tree, Grid, Fonts}) {
        QCOMPARE(rulesOf(kind).interval, 33);
        QCOMPARE(rulesOf(kind).flickDivisor, 30.0);
    }
}

void tst_flickmotion::endOfFlick_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<qreal>("start");
    QTest::addColumn<qreal>("end");
    QTest::addColumn<bool>("over");
    QTest::newRow("same") << int(Viewer) << 100.0 << 100.0 << true;
    QTest::newRow("five down") << int(Viewer) << 100.0 << 105.0 << true;
    QTest::newRow("five up") << int(Viewer) << 100.0 << 95.0 << true;
    QTest::newRow("little more than five") << int(Viewer) << 100.0 << 105.25 << false;
    QTest::newRow("six up") << int(Viewer) << 100.0 << 94.0 << false;
    QTest::newRow("tree: fraction does not count") << int(Tree) << 100.0 << 105.25 << true;
    QTest::newRow("tree: six") << int(Tree) << 100.0 << 106.0 << false;
    QTest::newRow("tree: minus five") << int(Tree) << 100.0 << 95.0 << true;
    QTest::newRow("grid: five") << int(Grid) << 10.0 << 5.0 << true;
    QTest::newRow("grid: six") << int(Grid) << 10.0 << 4.0 << false;
    QTest::newRow("fonts: six") << int(Fonts) << 10.0 << 16.0 << false;
}

void tst_flickmotion::endOfFlick()
{
    QFETCH(int, kind);
    QFETCH(qreal, start);
    QFETCH(qreal, end);
    QTEST(isFlickEnd(rulesOf(kind), QPointF(0, start), QPointF(500, end)), "over");
}

void tst_flickmotion::dragTick_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QPointF>("end"); // from (0, 0)
    QTest::addColumn<QPointF>("start");
    QTest::addColumn<QPointF>("distance");
    QTest::addColumn<int>("scroll");
    QTest::newRow("down") << int(Viewer) << QPointF(0, 40) << QPointF(0, 20) << QPointF(0, 20) << 20;
    QTest::newRow("up") << int(Viewer) << QPointF(0, -40) << QPointF(0, -20) << QPointF(0, -20) << -20;
    QTest::newRow("odd") << int(Viewer) << QPointF(0, 7) << QPointF(0, 4) << QPointF(0, 3.5) << 3;
    QTest::newRow("fraction cut") << int(Viewer) << QPointF(0, 6.9) << QPointF(0, 3) << QPointF(0, 3) << 3;
    QTest::newRow("sideways") << int(Viewer) << QPointF(20.6, 10) << QPointF(11, 5) << QPointF(10.3, 5) << 5;
    QTest::newRow("still") << int(Viewer) << QPointF(0, 0) << QPointF(0, 0) << QPointF(0, 0) << 0;
    QTest::newRow("one") << int(Viewer) << QPointF(0, 1) << QPointF(0, 1) << QPointF(0, 0.5) << 0;
    QTest::newRow("tree: still creeps down")
        << int(Tree) << QPointF(0, 0) << QPointF(0, 1) << QPointF(0, 1) << 1;
    QTest::newRow("tree: one is two") << int(Tree) << QPointF(0, 1) << QPointF(0, 1) << QPointF(0, 1) << 1;
    QTest::newRow("tree: minus one is two")
        << int(Tree) << QPointF(0, -1) << QPointF(0, -1) << QPointF(0, -1) << -1;
    QTest::newRow("tree: three") << int(Tree) << QPointF(0, 3) << QPointF(0, 2) << QPointF(0, 1.5) << 1;
    QTest::newRow("tree: up") << int(Tree) << QPointF(0, -30) << QPointF(0, -15) << QPointF(0, -15) << -15;
    QTest::newRow("grid") << int(Grid) << QPointF(0, 9) << QPointF(0, 5) << QPointF(0, 4.5) << 4;
    QTest::newRow("fonts") << int(Fonts) << QPointF(0, 12) << QPointF(0, 6) << QPointF(0, 6) << 6;
}

void tst_flickmotion::dragTick()
{
    QFETCH(int, kind);
    QFETCH(QPointF, end);
    const Step step = dragStep(rulesOf(kind), QPointF(), end);
    QTEST(step.start, "start");
    QTEST(step.distance, "distance");
    QTEST(step.scroll, "scroll");
    QVERIFY(!step.bounded);
}

void tst_flickmotion::flickTick_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QPointF>("end"); // from (0, 0)
    QTest::addColumn<QPointF>("start");
    QTest::addColumn<int>("scroll");
    QTest::newRow("thirtieth") << int(Viewer) << QPointF(0, 300) << QPointF(0, 10) << 150;
    QTest::newRow("thirtieth up") << int(Viewer) << QPointF(0, -300) << QPointF(0, -10) << -150;
    QTest::newRow("rounded") << int(Viewer) << QPointF(0, 80) << QPointF(0, 3) << 40;
    QTest::newRow("least") << int(Viewer) << QPointF(0, 6) << QPointF(0, 1) << 3;
    QTest::newRow("least up") << int(Viewer) << QPointF(0, -6) << QPointF(0, -1) << -3;
    QTest::newRow("cut") << int(Viewer) << QPointF(0, 61) << QPointF(0, 2) << 30;
    QTest::newRow("sideways") << int(Viewer) << QPointF(10, 60) << QPointF(0, 2) << 30;
    QTest::newRow("tree: sideways") << int(Tree) << QPointF(10, 60) << QPointF(1, 2) << 30;
    QTest::newRow("tree: sideways back") << int(Tree) << QPointF(-10, -60) << QPointF(-1, -2) << -30;
    QTest::newRow("tree: straight") << int(Tree) << QPointF(0, -20) << QPointF(0, -1) << -10;
    QTest::newRow("grid") << int(Grid) << QPointF(10, 91) << QPointF(0, 3) << 45;
    QTest::newRow("fonts") << int(Fonts) << QPointF(0, 90) << QPointF(0, 3) << 45;
}

void tst_flickmotion::flickTick()
{
    QFETCH(int, kind);
    QFETCH(QPointF, end);
    const Step step = flickStep(rulesOf(kind), QPointF(), end);
    QTEST(step.start, "start");
    QTEST(step.scroll, "scroll");
}

void tst_flickmotion::bounds_data()
{
    QTest::addColumn<int>("distance");
    QTest::addColumn<int>("top");
    QTest::addColumn<int>("bottom");
    QTest::addColumn<int>("result");
    QTest::addColumn<bool>("bounded");
    QTest::newRow("free") << 40 << 100 << 200 << 40 << false;
    QTest::newRow("free up") << -40 << 100 << 200 << -40 << false;
    QTest::newRow("just above the top row") << -99 << 100 << 200 << -99 << false;
    QTest::newRow("to the top row") << -100 << 100 << 200 << -100 << true;
    QTest::newRow("beyond the top") << -500 << 100 << 200 << -100 << true;
    QTest::newRow("to the last row") << 299 << 100 << 200 << 299 << false;
    QTest::newRow("beyond the end") << 300 << 100 << 200 << 299 << true;
    QTest::newRow("cut item comes in") << -10 << -30 << 70 << 30 << true;
    QTest::newRow("item on the last row stays") << 1 << 400 << 499 << 0 << true;
}

void tst_flickmotion::bounds()
{
    QFETCH(int, distance);
    QFETCH(int, top);
    QFETCH(int, bottom);
    bool bounded = false;
    QTEST(boundedDistance(distance, {top, bottom, 500}, &bounded), "result");
    QTEST(bounded, "bounded");
}

void tst_flickmotion::boundedTickKeepsTheItemInside()
{
    DragBounds item{100, 200, 500};
    QPointF start(0, 150);
    const QPointF end(0, -2000);
    for (int tick = 0; tick < 100; ++tick) {
        const Step step = dragStep(scrollViewer(), start, end, item);
        QVERIFY(step.bounded);
        start = step.start;
        item.top += step.scroll;
        item.bottom += step.scroll;
        QVERIFY(item.top >= 0);
    }
    QVERIFY(item.top <= 1);
}

void tst_flickmotion::dragCoversTheWay()
{
    QPointF start(0, 0);
    const QPointF end(0, 200);
    int moved = 0;
    int ticks = 0;
    for (; !isFlickEnd(scrollViewer(), start, end) && ticks < 50; ++ticks) {
        const Step step = dragStep(scrollViewer(), start, end);
        start = step.start;
        moved += step.scroll;
    }
    QVERIFY2(ticks <= 7, "the list lags behind the finger");
    QVERIFY(moved >= 190 && moved <= 200);
}

void tst_flickmotion::flickGlidesAndRests()
{
    for (const qreal way : {6.0, 90.0, 600.0, -600.0}) {
        QPointF start(0, 0);
        const QPointF end(0, way);
        qreal last = qAbs(way);
        int ticks = 0;
        for (; !isFlickEnd(scrollViewer(), start, end) && ticks < 1000; ++ticks) {
            const Step step = flickStep(scrollViewer(), start, end);
            QVERIFY(qAbs(step.distance.y()) <= last);
            last = qAbs(step.distance.y());
            start = step.start;
        }
        QVERIFY2(ticks < 300, "the flick stalls");
        QVERIFY(ticks >= 1);
    }
}

void tst_flickmotion::treeCreepsOn()
{
    const Step step = dragStep(treeView(), QPointF(3, 50), QPointF(3, 50));
    QCOMPARE(step.scroll, 1);
    QCOMPARE(step.start, QPointF(3, 51));
}

void tst_flickmotion::scrolling_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("offset");
    QTest::addColumn<int>("result");
    QTest::newRow("down") << 100 << -30 << 130;
    QTest::newRow("up") << 100 << 30 << 70;
    QTest::newRow("past the start") << 100 << 130 << 0;
    QTest::newRow("past the end") << 900 << -130 << 1000;
    QTest::newRow("huge") << 900 << std::numeric_limits<int>::min() << 1000;
}

void tst_flickmotion::scrolling()
{
    QFETCH(int, value);
    QFETCH(int, offset);
    QTEST(scrolledValue(value, offset, 0, 1000), "result");
    QCOMPARE(scrolledValue(value, offset, 0, -20), 0);
}

void tst_flickmotion::limits()
{
    QVERIFY(isAtLimit(0, 0, 10));
    QVERIFY(isAtLimit(10, 0, 10));
    QVERIFY(!isAtLimit(9, 0, 10));
}

void tst_flickmotion::slop_data()
{
    QTest::addColumn<QPointF>("position"); // from (50, 50)
    QTest::addColumn<bool>("touch");
    QTest::addColumn<bool>("mouse");
    QTest::newRow("none") << QPointF(50, 50) << false << false;
    QTest::newRow("5") << QPointF(50, 55) << false << false;
    QTest::newRow("6") << QPointF(50, 44) << false << true;
    QTest::newRow("3 and 3") << QPointF(53, 47) << false << true;
    QTest::newRow("20") << QPointF(50, 70) << false << true;
    QTest::newRow("21") << QPointF(50, 71) << true << true;
    QTest::newRow("10 and 11") << QPointF(40, 61) << true << true;
}

void tst_flickmotion::slop()
{
    QFETCH(QPointF, position);
    QTEST(isBeyondSlop(QPointF(50, 50), position, TOUCH_SLOP), "touch");
    QTEST(isBeyondSlop(QPointF(50, 50), position, MOUSE_SLOP), "mouse");
}

void tst_flickmotion::move_data()
{
    QTest::addColumn<QPointF>("current");
    QTest::addColumn<bool>("moved");
    QTest::newRow("20 straight") << QPointF(0, 20) << false;
    QTest::newRow("21 straight") << QPointF(0, -21) << true;
    QTest::newRow("12 and 16") << QPointF(12, 16) << false;
    QTest::newRow("15 and 14") << QPointF(15, 14) << true;
}

void tst_flickmotion::move()
{
    QFETCH(QPointF, current);
    QTEST(isMove(QPointF(), current), "moved");
}

void tst_flickmotion::dropping_data()
{
    QTest::addColumn<QList<int>>("tops");
    QTest::addColumn<int>("first");
    QTest::addColumn<int>("count");
    QTest::addColumn<int>("lifted");
    QTest::addColumn<int>("old");
    QTest::addColumn<int>("index");
    const QList<int> four{0, 104, 208, 312};
    QTest::newRow("empty list") << QList<int>() << 0 << 0 << 70 << 3 << 0;
    QTest::newRow("at the start") << four << 0 << 4 << 0 << 2 << 0;
    QTest::newRow("above the start") << four << 0 << 4 << -50 << 2 << 0;
    QTest::newRow("one row down") << four << 0 << 4 << 1 << 0 << 1;
    QTest::newRow("exactly on a top") << four << 0 << 4 << 208 << 0 << 2;
    QTest::newRow("on the last top") << four << 0 << 4 << 312 << 0 << 3;
    QTest::newRow("past the last") << four << 0 << 4 << 313 << 0 << 4;
    QTest::newRow("past the visible ones") << four << 5 << 20 << 313 << 7 << 7;
    QTest::newRow("visible ones") << four << 5 << 20 << 100 << 7 << 6;
    QTest::newRow("past the visible end") << four << 16 << 20 << 400 << 17 << 20;
    QTest::newRow("none visible") << QList<int>() << 0 << 20 << 400 << 17 << 17;
}

void tst_flickmotion::dropping()
{
    QFETCH(QList<int>, tops);
    QFETCH(int, first);
    QFETCH(int, count);
    QFETCH(int, lifted);
    QFETCH(int, old);
    const std::vector<int> candidates(tops.cbegin(), tops.cend());
    QTEST(dropIndex(candidates, first, count, lifted, old), "index");
}

void tst_flickmotion::edgeScrolling_data()
{
    QTest::addColumn<int>("top");
    QTest::addColumn<int>("overhang");
    QTest::addColumn<bool>("runs");
    QTest::addColumn<int>("offset"); // where it runs
    QTest::newRow("middle") << 300 << -500 << false << 0;
    QTest::newRow("9 above") << -9 << -500 << false << 0;
    QTest::newRow("10 above") << -10 << -500 << true << 10;
    QTest::newRow("30 above") << -30 << -500 << true << 10;
    QTest::newRow("31 above") << -31 << -500 << true << 30;
    QTest::newRow("9 below") << 300 << 9 << false << 0;
    QTest::newRow("10 below") << 300 << 10 << true << -10;
    QTest::newRow("30 below") << 300 << 30 << true << -10;
    QTest::newRow("31 below") << 300 << 31 << true << -30;
    QTest::newRow("taller than the list") << -12 << 40 << true << 10;
}

void tst_flickmotion::edgeScrolling()
{
    QFETCH(int, top);
    QFETCH(int, overhang);
    QFETCH(bool, runs);
    QCOMPARE(needsEdgeScroll(top, overhang), runs);
    if (runs)
        QTEST(edgeScrollOffset(top, overhang), "offset");
}

void tst_flickmotion::sliding_data()
{
    QTest::addColumn<QPoint>("target");
    QTest::addColumn<QPoint>("result");
    QTest::newRow("free") << QPoint(500, 300) << QPoint(500, 300);
    QTest::newRow("left edge") << QPoint(-70, 300) << QPoint(0, 300);
    QTest::newRow("right edge") << QPoint(1900, 300) << QPoint(1280, 300);
    QTest::newRow("top edge") << QPoint(500, -9) << QPoint(500, 0);
    QTest::newRow("bottom edge") << QPoint(500, 1000) << QPoint(500, 747);
    QTest::newRow("corner stops") << QPoint(-5, -5) << QPoint(7, 7);
    QTest::newRow("far corner stops") << QPoint(3000, 3000) << QPoint(7, 7);
}

void tst_flickmotion::sliding()
{
    QFETCH(QPoint, target);
    QTEST(slideInside(target, QPoint(7, 7), QRect(0, 0, 1920, 1080), QSize(640, 333)), "result");
}

void tst_flickmotion::nonsense()
{
    const qreal infinity = std::numeric_limits<qreal>::infinity();
    const qreal nan = std::numeric_limits<qreal>::quiet_NaN();
    for (int kind : {Viewer, Tree, Grid, Fonts}) {
        const Rules rules = rulesOf(kind);
        QVERIFY(isFlickEnd(rules, QPointF(nan, nan), QPointF()));
        QVERIFY(!isFlickEnd(rules, QPointF(0, infinity), QPointF()));
        QVERIFY(qIsFinite(flickStep(rules, QPointF(infinity, -infinity), QPointF(nan, infinity)).start.y()));
        QVERIFY(qIsFinite(dragStep(rules, QPointF(infinity, -infinity), QPointF(nan, infinity)).start.y()));
    }
}

QTEST_GUILESS_MAIN(tst_flickmotion)
#include "tst_flickmotion.moc"

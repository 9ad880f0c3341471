// Where menus and balloons go.
#include "touchui/MenuPlacement.h"

#include <QTest>

using namespace MenuPlacement;

class tst_menuplacement : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void top_data();
    void top();
    void left_data();
    void left();
    void arrow_data();
    void arrow();
    void balloon_data();
    void balloon();
    void backgroundLeavesRoomForTheArrow();
    void rows();
};

namespace
{

const QRect SCREEN(0, 0, 1920, 1080);

} // namespace

void tst_menuplacement::top_data()
{
    QTest::addColumn<int>("flags");
    QTest::addColumn<int>("anchor");
    QTest::addColumn<QRect>("bounds");
    QTest::addColumn<int>("expected");
    QTest::newRow("below") << int(Below) << 100 << SCREEN << 100;
    QTest::newRow("below wins over above") << (Below | Above) << 100 << SCREEN << 100;
    QTest::newRow("below, starting at the anchor") << (Below | Horizontal) << 100 << SCREEN << 100;
    QTest::newRow("above: 45 under the anchor") << int(Above) << 600 << SCREEN << 645 - 300;
    QTest::newRow("above: 11 left at the bottom") << int(Above) << 1024 << SCREEN << 1069 - 300;
    QTest::newRow("above: 10 left at the bottom") << int(Above) << 1025 << SCREEN << 1067 - 300;
    QTest::newRow("above: past the bottom") << int(Above) << 1079 << SCREEN << 1067 - 300;
    QTest::newRow("neither: 9 over the anchor") << 0 << 600 << SCREEN << 591 - 300;
    QTest::newRow("horizontal alone") << int(Horizontal) << 600 << SCREEN << 591 - 300;
    QTest::newRow("kept inside at the top") << 0 << 100 << SCREEN << 0;
    QTest::newRow("kept inside at the bottom") << int(Below) << 1000 << SCREEN << 780;
    QTest::newRow("other bounds") << int(Above) << 500 << QRect(100, 200, 600, 400) << 545 - 300;
    QTest::newRow("other bounds, bottom") << int(Above) << 590 << QRect(100, 200, 600, 400) << 587 - 300;
    QTest::newRow("higher than the bounds") << int(Below) << 50 << QRect(0, 40, 100, 200) << 40;
}

void tst_menuplacement::top()
{
    QFETCH(int, flags);
    QFETCH(int, anchor);
    QFETCH(QRect, bounds);
    QTEST(menuTop(flags, anchor, 300, bounds), "expected");
}

void tst_menuplacement::left_data()
{
    QTest::addColumn<int>("flags");
    QTest::addColumn<int>("anchor");
    QTest::addColumn<int>("expected");
    const int inset = ARROW_INSET + ARROW_WIDTH / 2;
    QTest::newRow("centred") << int(Below) << 900 << 800;
    QTest::newRow("centred, at the left edge") << int(Below) << 20 << 0;
    QTest::newRow("centred, at the right edge") << int(Below) << 1900 << 1720;
    QTest::newRow("horizontal starts at the anchor") << (Below | Horizontal) << 900 << 900 - inset;
    QTest::newRow("beside, right") << int(Above) << 900 << 900;
    QTest::newRow("beside, just room at the right") << int(Above) << 1720 << 1720;
    QTest::newRow("beside, left") << int(Above) << 1721 << 1521;
}

void tst_menuplacement::left()
{
    QFETCH(int, flags);
    QFETCH(int, anchor);
    QTEST(menuLeft(flags, anchor, 200, SCREEN), "expected");
}

void tst_menuplacement::arrow_data()
{
    QTest::addColumn<int>("flags");
    QTest::addColumn<QPoint>("anchor");
    QTest::addColumn<int>("side");
    QTest::addColumn<QPoint>("tip"); // in the bounds' coordinates
    QTest::newRow("below") << int(Below) << QPoint(900, 100) << int(ArrowSide::Top) << QPoint(900, 100);
    QTest::newRow("over") << 0 << QPoint(900, 600) << int(ArrowSide::Bottom) << QPoint(900, 590);
    QTest::newRow("beside right") << int(Above) << QPoint(900, 600) << int(ArrowSide::Left)
                                  << QPoint(900, 600);
    QTest::newRow("beside left") << int(Above) << QPoint(1800, 600) << int(ArrowSide::Right)
                                 << QPoint(1799, 600);
    QTest::newRow("in the corner") << int(Below) << QPoint(3, 100) << int(ArrowSide::Top)
                                   << QPoint(ARROW_INSET + ARROW_WIDTH / 2, 100);
}

void tst_menuplacement::arrow()
{
    QFETCH(int, flags);
    QFETCH(QPoint, anchor);
    const Placement placement = placeMenu(flags, anchor, QSize(200, 300), SCREEN);
    QTEST(int(placement.side), "side");
    QTEST(placement.rect.topLeft() + placement.tip, "tip");
    QVERIFY(SCREEN.contains(placement.rect));
}

void tst_menuplacement::balloon_data()
{
    QTest::addColumn<QRect>("anchor");
    QTest::addColumn<bool>("below");
    QTest::addColumn<QRect>("rect");
    QTest::addColumn<int>("side");
    const int up = int(ArrowSide::Top);
    const int down = int(ArrowSide::Bottom);
    QTest::newRow("over") << QRect(500, 500, 40, 20) << false << QRect(470, 440, 100, 60) << down;
    QTest::newRow("no room over") << QRect(500, 50, 40, 20) << false << QRect(470, 70, 100, 60) << up;
    QTest::newRow("just room over") << QRect(500, 60, 40, 20) << false << QRect(470, 0, 100, 60) << down;
    QTest::newRow("under") << QRect(500, 500, 40, 20) << true << QRect(470, 520, 100, 60) << up;
    QTest::newRow("no room under") << QRect(500, 1010, 40, 20) << true << QRect(470, 950, 100, 60) << down;
    QTest::newRow("left edge") << QRect(0, 500, 40, 20) << false << QRect(0, 440, 100, 60) << down;
    QTest::newRow("right edge") << QRect(1900, 500, 20, 20) << false << QRect(1820, 440, 100, 60) << down;
    QTest::newRow("no room at all") << QRect(0, 0, 1920, 1080) << false << QRect(910, 0, 100, 60) << down;
}

void tst_menuplacement::balloon()
{
    QFETCH(QRect, anchor);
    QFETCH(bool, below);
    const Placement placement = placeBalloon(anchor, QSize(100, 60), SCREEN, below);
    QTEST(placement.rect, "rect");
    QTEST(int(placement.side), "side");
    QVERIFY(QRect(QPoint(), placement.rect.size()).contains(placement.tip));
}

void tst_menuplacement::backgroundLeavesRoomForTheArrow()
{
    const QSize size(100, 80);
    QCOMPARE(background(size, ArrowSide::Top), QRect(0, 12, 100, 68));
    QCOMPARE(background(size, ArrowSide::Bottom), QRect(0, 0, 100, 68));
    QCOMPARE(background(size, ArrowSide::Left), QRect(12, 0, 88, 80));
    QCOMPARE(background(size, ArrowSide::Right), QRect(0, 0, 88, 80));
}

void tst_menuplacement::rows()
{
    const QRect area(0, 12, 100, 79); // 63 without the border, which three do not divide by 2
    QCOMPARE(rowRect(area, 8, 3, 0), QRect(8, 20, 84, 21));
    QCOMPARE(rowRect(area, 8, 2, 1), QRect(8, 51, 84, 32));
    QVERIFY(rowRect(area, 8, 3, 3).isNull());
    QVERIFY(rowRect(area, 8, 3, -1).isNull());
    QVERIFY(rowRect(area, 8, 0, 0).isNull());
    QCOMPARE(rowAt(area, 8, 3, QPoint(8, 20)), 0);
    QCOMPARE(rowAt(area, 8, 3, QPoint(50, 41)), 1);
    QCOMPARE(rowAt(area, 8, 3, QPoint(91, 82)), 2);
    QCOMPARE(rowAt(area, 8, 3, QPoint(92, 82)), -1);
    QCOMPARE(rowAt(area, 8, 3, QPoint(50, 19)), -1);
    QCOMPARE(rowAt(area, 8, 0, QPoint(50, 50)), -1);
}

QTEST_MAIN(tst_menuplacement)
#include "tst_menuplacement.moc"

#include "canvas/TextPlacement.h"

#include "canvas/TextObjectConstants.h"

#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QGraphicsTextItem>
#include <QTest>

using namespace TextObjectConstants;

// The place of a text object, and how far it may be moved.
class tst_textplacement : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void range_data();
    void range();
    void limits_data();
    void limits();
    void insideStays();
    void pairFollowsTheFinger();
    void pairIsShifted();
    void objectWithoutAParent();
    void remembersThatItWasMoved();
};

namespace
{

// A text in a parent, as an object on the canvas is.
struct Placed {
    Placed()
    {
        scene.setSceneRect(SCENE_RECT);
        scene.addItem(&parent);
        text.setPlainText(QStringLiteral("some text"));
        text.setFlag(QGraphicsItem::ItemIsMovable);
        text.setParentItem(&parent);
        parent.setPos(300.0, 200.0);
    }
    QSizeF size() const { return text.boundingRect().size(); }

    QGraphicsScene scene;
    QGraphicsRectItem parent;
    QGraphicsTextItem text;
    TextPlacement placement{text};
};

} // namespace

void tst_textplacement::range_data()
{
    QTest::addColumn<QPointF>("corner");
    QTest::addColumn<int>("side");
    // The object is 200 wide and 150 high. Beyond two limits the vertical one counts.
    QTest::newRow("inside") << QPointF(10.0, 10.0) << 0;
    QTest::newRow("far left") << QPointF(-5000.0, 10.0) << 1;
    QTest::newRow("far right") << QPointF(5000.0, 10.0) << 2;
    QTest::newRow("far up") << QPointF(10.0, -5000.0) << 3;
    QTest::newRow("far down") << QPointF(10.0, 5000.0) << 4;
    QTest::newRow("left and up") << QPointF(-5000.0, -5000.0) << 3;
    QTest::newRow("right and down") << QPointF(5000.0, 5000.0) << 4;
    QTest::newRow("left edge") << QPointF(-100.0, 10.0) << 0;
    QTest::newRow("beyond the left edge") << QPointF(-100.5, 10.0) << 1;
    QTest::newRow("right edge") << QPointF(1180.0, 10.0) << 0;
    QTest::newRow("beyond the right edge") << QPointF(1180.5, 10.0) << 2;
    QTest::newRow("upper edge") << QPointF(10.0, -50.0) << 0;
    QTest::newRow("beyond the upper edge") << QPointF(10.0, -50.5) << 3;
    QTest::newRow("lower edge") << QPointF(10.0, 620.0) << 0;
    QTest::newRow("beyond the lower edge") << QPointF(10.0, 620.5) << 4;
}

void tst_textplacement::range()
{
    QFETCH(QPointF, corner);
    QFETCH(int, side);
    QCOMPARE(int(TextPlacement::itemIsOutOfRange(corner, QSizeF(200.0, 150.0))), side);
}

void tst_textplacement::limits_data()
{
    QTest::addColumn<QPointF>("wanted");
    // taken: what is subtracted from the place; reach: what is added to the point from which the finger
    // drags.
    QTest::addColumn<QPointF>("corner");
    QTest::addColumn<QPointF>("taken");
    QTest::addColumn<QPointF>("reach");
    QTest::newRow("left") << QPointF(-900.0, 200.0) << QPointF(0.0, 200.0) << QPointF(1.0, 0.0)
                          << QPointF(2.0, 0.0);
    QTest::newRow("right") << QPointF(2900.0, 200.0) << QPointF(1180.0, 200.0) << QPointF() << QPointF();
    QTest::newRow("up") << QPointF(300.0, -900.0) << QPointF(300.0, 0.0) << QPointF(0.0, 1.0)
                        << QPointF(0.0, 3.0);
    QTest::newRow("down") << QPointF(300.0, 2900.0) << QPointF(300.0, 620.0) << QPointF() << QPointF();
}

void tst_textplacement::limits()
{
    QFETCH(QPointF, wanted);
    QFETCH(QPointF, corner);
    QFETCH(QPointF, taken);
    QFETCH(QPointF, reach);
    Placed placed;
    const QPointF outside(placed.size().width() - 100.0, placed.size().height() - 100.0);
    const QPointF place = corner - QPointF(taken.x() * outside.x(), taken.y() * outside.y());
    const TextPlacement::Side side = placed.placement.itemIsOutOfRange(wanted);
    QVERIFY(side != TextPlacement::Inside);
    const QPointF drag = placed.placement.adjustItemPos(side);
    QCOMPARE(placed.parent.pos(), place);
    QCOMPARE(drag, place + QPointF(reach.x() * outside.x(), reach.y() * outside.y()));
    QVERIFY(placed.placement.isMoved());
}

void tst_textplacement::insideStays()
{
    Placed placed;
    QCOMPARE(placed.placement.adjustItemPos(TextPlacement::Inside), QPointF(300.0, 200.0));
    QCOMPARE(placed.parent.pos(), QPointF(300.0, 200.0));
    QVERIFY(!placed.placement.isMoved());
}

// Qt drags the child; the parent takes the step over.
void tst_textplacement::pairFollowsTheFinger()
{
    Placed placed;
    placed.text.setPos(7.0, -3.0);
    QCOMPARE(placed.placement.place(), QPointF(300.0, 200.0));
    QCOMPARE(placed.placement.textPlace(), QPointF(307.0, 197.0));
    placed.placement.followFinger(QPointF(7.0, -3.0));
    QCOMPARE(placed.parent.pos(), QPointF(307.0, 197.0));
    QCOMPARE(placed.text.pos(), QPointF());
    placed.placement.placePair(QPointF(20.0, 30.0));
    QCOMPARE(placed.placement.textPlace(), QPointF(20.0, 30.0));
}

void tst_textplacement::pairIsShifted()
{
    Placed placed;
    QVERIFY(placed.placement.isPair());
    placed.placement.shift(-12.5);
    QCOMPARE(placed.parent.pos(), QPointF(287.5, 200.0));
    QCOMPARE(placed.text.pos(), QPointF());
}

void tst_textplacement::objectWithoutAParent()
{
    QGraphicsTextItem text(QStringLiteral("alone"));
    text.setPos(40.0, 50.0);
    TextPlacement placement(text);
    QVERIFY(!placement.isPair());
    placement.shift(10.0);
    placement.followFinger(QPointF(10.0, 10.0));
    placement.placePair(QPointF(1.0, 2.0));
    QCOMPARE(text.pos(), QPointF(40.0, 50.0));
    placement.setPlace(QPointF(60.0, 70.0));
    QCOMPARE(text.pos(), QPointF(60.0, 70.0));
    placement.setMovable(true);
    QVERIFY(text.flags() & QGraphicsItem::ItemIsMovable);
    placement.setMovable(false);
    QVERIFY(!(text.flags() & QGraphicsItem::ItemIsMovable));
}

void tst_textplacement::remembersThatItWasMoved()
{
    Placed placed;
    placed.placement.markMoved();
    QVERIFY(placed.placement.isMoved());
    placed.placement.clearMoved();
    QVERIFY(!placed.placement.isMoved());
}

QTEST_MAIN(tst_textplacement)
#include "tst_textplacement.moc"

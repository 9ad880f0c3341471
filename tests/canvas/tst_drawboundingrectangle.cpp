#include "canvas/DrawBoundingRectangle.h"

#include <QImage>
#include <QPainter>
#include <QTemporaryDir>
#include <QTest>

// The nine pieces of a frame, each in a colour of its own.
class tst_drawboundingrectangle : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void piecesLieWhereTheyBelong();
    void cornersOnly();
    void smallerThanTheCorners();
    void dialogTakesTheSamePieces();
    void missingPicturesStayTransparent();
    void sizesOfKinds_data();
    void sizesOfKinds();
    void paintsTheSameWithoutAPixmap_data();
    void paintsTheSameWithoutAPixmap();

private:
    QTemporaryDir m_folder;
    QStringList m_names;
    QList<QColor> m_colors{Qt::red,    Qt::green,   Qt::blue,      Qt::cyan,    Qt::magenta,
                           Qt::yellow, Qt::darkRed, Qt::darkGreen, Qt::darkBlue};
};

void tst_drawboundingrectangle::initTestCase()
{
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    for (int i = 0; i < DrawBoundingRectangle::PieceCount; ++i) {
        // The lower row is higher than the upper one.
        QImage piece(10, i <= DrawBoundingRectangle::BottomLeft ? 8 : 5, QImage::Format_ARGB32);
        piece.fill(m_colors.at(i));
        m_names.append(m_folder.path() + QStringLiteral("/%1.png").arg(i));
        QVERIFY(piece.save(m_names.last()));
    }
}

void tst_drawboundingrectangle::piecesLieWhereTheyBelong()
{
    DrawBoundingRectangle painter;
    const QImage image = painter.drawImage(m_names, QSize(100, 60)).toImage();
    QCOMPARE(image.size(), QSize(100, 60));
    using P = DrawBoundingRectangle;
    QCOMPARE(image.pixelColor(0, 0), m_colors.at(P::UpperLeft));
    QCOMPARE(image.pixelColor(9, 4), m_colors.at(P::UpperLeft));
    QCOMPARE(image.pixelColor(10, 4), m_colors.at(P::UpperCenter));
    QCOMPARE(image.pixelColor(89, 0), m_colors.at(P::UpperCenter));
    QCOMPARE(image.pixelColor(90, 0), m_colors.at(P::UpperRight));
    QCOMPARE(image.pixelColor(0, 5), m_colors.at(P::MiddleLeft));
    QCOMPARE(image.pixelColor(50, 30), m_colors.at(P::MiddleCenter));
    QCOMPARE(image.pixelColor(99, 51), m_colors.at(P::MiddleRight));
    QCOMPARE(image.pixelColor(0, 52), m_colors.at(P::BottomLeft));
    QCOMPARE(image.pixelColor(50, 59), m_colors.at(P::BottomCenter));
    QCOMPARE(image.pixelColor(99, 59), m_colors.at(P::BottomRight));
}

void tst_drawboundingrectangle::cornersOnly()
{
    DrawBoundingRectangle painter;
    const QImage image = painter.drawImage(m_names, QSize(20, 13)).toImage();
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QColor expected = y < 5 ? m_colors.at(x < 10 ? DrawBoundingRectangle::UpperLeft
                                                               : DrawBoundingRectangle::UpperRight)
                                          : m_colors.at(x < 10 ? DrawBoundingRectangle::BottomLeft
                                                               : DrawBoundingRectangle::BottomRight);
            QCOMPARE(image.pixelColor(x, y), expected);
        }
    }
}

void tst_drawboundingrectangle::smallerThanTheCorners()
{
    DrawBoundingRectangle painter;
    QCOMPARE(painter.drawImage(m_names, QSize(12, 6)).size(), QSize(12, 6));
    QVERIFY(painter.drawImage(m_names, QSize()).isNull());
    const QImage none = painter.drawImage({"a", "b"}, QSize(10, 10)).toImage();
    QCOMPARE(none.pixelColor(5, 5).alpha(), 0);
}

void tst_drawboundingrectangle::dialogTakesTheSamePieces()
{
    DrawBoundingRectangle painter;
    QCOMPARE(painter.drawImageLikeAsKSDialog(m_names, QSize(100, 60)).toImage(),
             painter.drawImage(m_names, QSize(100, 60)).toImage());
}

void tst_drawboundingrectangle::missingPicturesStayTransparent()
{
    DrawBoundingRectangle painter;
    QStringList names = m_names;
    names[DrawBoundingRectangle::UpperCenter] = ":/no/such/picture";
    const QImage image = painter.drawImage(names, QSize(100, 60)).toImage();
    QCOMPARE(image.pixelColor(50, 2).alpha(), 0);
    QCOMPARE(image.pixelColor(0, 0), m_colors.at(DrawBoundingRectangle::UpperLeft));
}

void tst_drawboundingrectangle::sizesOfKinds_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QSize>("size");
    QTest::newRow("1") << 1 << QSize(1902, 1064);
    QTest::newRow("2") << 2 << QSize(547, 1002);
    QTest::newRow("3") << 3 << QSize(389, 121);
    QTest::newRow("4") << 4 << QSize(654, 351);
    QTest::newRow("5") << 5 << QSize(1088, 742);
    QTest::newRow("6") << 6 << QSize(802, 568);
    QTest::newRow("7") << 7 << QSize(1371, 833);
    QTest::newRow("8") << 8 << QSize(1053, 599);
    QTest::newRow("9") << 9 << QSize(200, 210);
    QTest::newRow("none") << 10 << QSize(0, 0);
}

void tst_drawboundingrectangle::sizesOfKinds()
{
    QFETCH(int, kind);
    QFETCH(QSize, size);
    DrawBoundingRectangle painter;
    QCOMPARE(painter.paintBoundingRectangle(kind).size(), size);
}

void tst_drawboundingrectangle::paintsTheSameWithoutAPixmap_data()
{
    QTest::addColumn<int>("kind");
    for (const int kind : {1, 2, 3, 4, 5, 6, 8, 9, 10})
        QTest::addRow("%d", kind) << kind;
}

void tst_drawboundingrectangle::paintsTheSameWithoutAPixmap()
{
    QFETCH(int, kind);
    DrawBoundingRectangle background;
    QImage wanted(1920, 1080, QImage::Format_RGB32);
    wanted.fill(QColor(40, 90, 20));
    const QImage plain = wanted;
    QImage painted = wanted;
    {
        QPainter painter(&wanted);
        painter.drawPixmap(7, 11, background.paintBoundingRectangle(kind));
    }
    QPainter painter(&painted);
    background.paintBackground(painter, QPoint(7, 11), 2); // another kind first
    painter.fillRect(painted.rect(), QColor(40, 90, 20));
    background.paintBackground(painter, QPoint(7, 11), kind);
    QCOMPARE(painter.worldTransform(), QTransform());
    painter.end();
    QCOMPARE(painted, wanted);
    QCOMPARE(wanted == plain, kind == 10);
}

QTEST_MAIN(tst_drawboundingrectangle)
#include "tst_drawboundingrectangle.moc"

// Stretchable frames: where their pieces go, and that they join.
#include "touchui/NineSlice.h"
#include "touchui/SliceFrame.h"

#include <QPainter>
#include <QTemporaryDir>
#include <QTest>

namespace
{

bool isSame(QRgb a, QRgb b)
{
    return qAbs(qRed(a) - qRed(b)) <= 1 && qAbs(qGreen(a) - qGreen(b)) <= 1 &&
           qAbs(qBlue(a) - qBlue(b)) <= 1 && qAlpha(a) == qAlpha(b);
}

} // namespace

class tst_nineslice : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cells_data();
    void cells();
    void cellsTile_data();
    void cellsTile();
    void rowAndColumn();
    void framePaintsEveryPixelAtEverySize();
    void missingPiecesStayUndrawn();
    void libraryFramesHaveNoSeams_data();
    void libraryFramesHaveNoSeams();
};

void tst_nineslice::cells_data()
{
    QTest::addColumn<QRect>("target");
    QTest::addColumn<QMargins>("corners");
    QTest::addColumn<QRect>("upperLeft");
    QTest::addColumn<QRect>("middleCenter");
    QTest::addColumn<QRect>("bottomRight");
    const QMargins corners(10, 20, 30, 40);
    QTest::newRow("roomy") << QRect(5, 6, 100, 100) << corners << QRect(5, 6, 10, 20) << QRect(15, 26, 60, 40)
                           << QRect(75, 66, 30, 40);
    QTest::newRow("just the corners") << QRect(0, 0, 40, 60) << corners << QRect(0, 0, 10, 20)
                                      << QRect(10, 20, 0, 0) << QRect(10, 20, 30, 40);
    QTest::newRow("too small") << QRect(0, 0, 20, 30) << corners << QRect(0, 0, 5, 10) << QRect(5, 10, 0, 0)
                               << QRect(5, 10, 15, 20);
    QTest::newRow("no corners") << QRect(0, 0, 20, 30) << QMargins() << QRect(0, 0, 0, 0)
                                << QRect(0, 0, 20, 30) << QRect(20, 30, 0, 0);
    QTest::newRow("nothing") << QRect(3, 4, 0, 0) << corners << QRect(3, 4, 0, 0) << QRect(3, 4, 0, 0)
                             << QRect(3, 4, 0, 0);
    QTest::newRow("negative") << QRect(3, 4, -7, -7) << corners << QRect(3, 4, 0, 0) << QRect(3, 4, 0, 0)
                              << QRect(3, 4, 0, 0);
}

void tst_nineslice::cells()
{
    QFETCH(QRect, target);
    QFETCH(QMargins, corners);
    const NineSlice::Cells cells = NineSlice::cells(target, corners);
    QTEST(cells[NineSlice::UpperLeft], "upperLeft");
    QTEST(cells[NineSlice::MiddleCenter], "middleCenter");
    QTEST(cells[NineSlice::BottomRight], "bottomRight");
}

void tst_nineslice::cellsTile_data()
{
    QTest::addColumn<QSize>("size");
    for (const QSize& size :
         {QSize(1, 1), QSize(7, 3), QSize(32, 32), QSize(33, 200), QSize(501, 17), QSize(1920, 1080)})
        QTest::addRow("%dx%d", size.width(), size.height()) << size;
}

void tst_nineslice::cellsTile()
{
    QFETCH(QSize, size);
    const QRect target(QPoint(-3, 11), size);
    QRegion covered;
    qint64 area = 0;
    for (const QRect& cell : NineSlice::cells(target, QMargins(16, 16, 16, 16))) {
        covered += cell;
        area += qint64(cell.width()) * cell.height();
    }
    QCOMPARE(covered, QRegion(target));
    QCOMPARE(area, qint64(size.width()) * size.height()); // so none overlaps another
}

void tst_nineslice::rowAndColumn()
{
    const NineSlice::Triple row = NineSlice::row(QRect(2, 3, 50, 20), 10, 15);
    QCOMPARE(row[0], QRect(2, 3, 10, 20));
    QCOMPARE(row[1], QRect(12, 3, 25, 20));
    QCOMPARE(row[2], QRect(37, 3, 15, 20));
    const NineSlice::Triple column = NineSlice::column(QRect(2, 3, 20, 50), 10, 15);
    QCOMPARE(column[0], QRect(2, 3, 20, 10));
    QCOMPARE(column[1], QRect(2, 13, 20, 25));
    QCOMPARE(column[2], QRect(2, 38, 20, 15));
    const NineSlice::Triple narrow = NineSlice::row(QRect(0, 0, 10, 5), 10, 30);
    QCOMPARE(narrow[0], QRect(0, 0, 2, 5));
    QCOMPARE(narrow[1].width(), 0);
    QCOMPARE(narrow[2], QRect(2, 0, 8, 5));
}

void tst_nineslice::framePaintsEveryPixelAtEverySize()
{
    QTemporaryDir folder;
    QStringList paths;
    for (int i = 0; i < NineSlice::PieceCount; ++i) {
        QImage piece(6, 6, QImage::Format_ARGB32);
        piece.fill(QColor(20 * i, 200, 255 - 20 * i));
        paths.append(folder.filePath(QStringLiteral("%1.png").arg(i)));
        QVERIFY(piece.save(paths.constLast()));
    }
    const SliceFrame frame(paths);
    QCOMPARE(frame.corners(), QMargins(6, 6, 6, 6));
    for (const QSize& size : {QSize(12, 12), QSize(13, 40), QSize(200, 90)}) {
        QImage image(size, QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::transparent);
        QPainter painter(&image);
        frame.paint(painter, image.rect());
        painter.end();
        for (int y = 0; y < size.height(); ++y)
            for (int x = 0; x < size.width(); ++x)
                QCOMPARE(image.pixelColor(x, y).alpha(), 255);
        QCOMPARE(image.pixelColor(0, 0), QColor(0, 200, 255));
        QCOMPARE(image.pixelColor(size.width() - 1, size.height() - 1), QColor(160, 200, 95));
    }
}

void tst_nineslice::missingPiecesStayUndrawn()
{
    QVERIFY(SliceFrame().corners().isNull());
    QVERIFY(SliceFrame(QStringList{QStringLiteral("one")}).corners().isNull());
    const SliceFrame frame(SliceFrame::family(QStringLiteral(":/nowhere/")));
    QVERIFY(frame.corners().isNull());
    QImage image(30, 30, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    frame.paint(painter, image.rect());
    painter.end();
    QCOMPARE(image.pixelColor(15, 15).alpha(), 0);
}

void tst_nineslice::libraryFramesHaveNoSeams_data()
{
    QTest::addColumn<QString>("prefix");
    QTest::newRow("menu") << ":/Dialog/dialog_base_";
    QTest::newRow("list") << ":/Dialog/Dialog_base_";
    QTest::newRow("balloon") << ":/ToolTip/Balloon_Common_";
    QTest::newRow("pane") << ":/Pane_Tab/Pane_";
}

// Along a line that crosses the joints between corner and middle, the colour does not jump: the middle goes
// on with the corner's last colour. Smoothing may round by a level.
void tst_nineslice::libraryFramesHaveNoSeams()
{
    Q_INIT_RESOURCE(UILibrary);
    QFETCH(QString, prefix);
    const SliceFrame frame(SliceFrame::family(prefix));
    QVERIFY(!frame.corners().isNull());
    const QMargins corners = frame.corners();
    for (const QSize& size :
         {QSize(corners.left() + corners.right() + 1, 90), QSize(301, 77), QSize(1920, 1080)}) {
        QImage image(size, QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::transparent);
        QPainter painter(&image);
        frame.paint(painter, image.rect());
        painter.end();
        const int right = size.width() - corners.right();
        const int bottom = size.height() - corners.bottom();
        for (int y = 0; y < size.height(); ++y) {
            QVERIFY(isSame(image.pixel(corners.left(), y), image.pixel(corners.left() - 1, y)));
            QVERIFY(isSame(image.pixel(right - 1, y), image.pixel(right, y)));
        }
        for (int x = 0; x < size.width(); ++x) {
            QVERIFY(isSame(image.pixel(x, corners.top()), image.pixel(x, corners.top() - 1)));
            QVERIFY(isSame(image.pixel(x, bottom - 1), image.pixel(x, bottom)));
        }
    }
}

QTEST_MAIN(tst_nineslice)
#include "tst_nineslice.moc"

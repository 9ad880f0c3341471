#include "tests/canvas/CanvasFixture.h"
#include "tests/canvas/StyleProperties.h"

#include "library/ThumbnailRender.h"
#include "tests/support/Patience.h"

#include <QPainter>

// The three pictures of a title: the canvas that is edited, the small picture of the list, and the picture
// for air. For every property they show the same, up to the rounding of glyphs and the darker, unscaled
// shadows of the pictures.
class tst_thumbnailrender_canvas : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void everyProperty_data();
    void everyProperty();
    void everyPlace();
    void manyLinesAndScripts();

private:
    struct Pictures {
        QImage canvas; // 1280x720
        QImage list;   // 240x135
        QImage air;    // 1920x1080
    };
    static Pictures picturesOf(const QList<TText>& texts);
    static QImage onGrey(const QImage& image, QSize size);
    // The largest difference of the mean colours of two cells, 0 to 255.
    static double worstCell(const QImage& a, const QImage& b, int cell);
    static QRect ink(const QImage& image);
    static void compare(const Pictures& pictures, double tolerance, int edge);

    Pictures m_plain;
};

void tst_thumbnailrender_canvas::init()
{
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

tst_thumbnailrender_canvas::Pictures tst_thumbnailrender_canvas::picturesOf(const QList<TText>& texts)
{
    Pictures pictures;
    Canvas canvas;
    canvas.title.setThumbnailBig("title_1920.png");
    canvas.title.setThumbnailMiddle("title_960.png");
    canvas.title.setThumbnailSmall("title_240.png");
    canvas.title.setThumbnailBlack("title_240S.png");
    canvas.open(texts);
    pictures.canvas = QImage(1280, 720, QImage::Format_ARGB32_Premultiplied);
    pictures.canvas.fill(Qt::transparent);
    QPainter painter(&pictures.canvas);
    painter.setRenderHint(QPainter::Antialiasing);
    canvas.scene->render(&painter, QRectF(0, 0, 1280, 720), QRectF(0, 0, 1280, 720));
    painter.end();
    // The pictures are made from what was saved.
    canvas.scene->saveArchive();
    const auto saved = canvas.saved();
    if (!saved)
        return {};
    ThumbnailRender render;
    QObject::connect(&render, &IThumbnailRender::saveHalfThumbnailsOK, &render,
                     [&pictures](const QString&, const QImage& image) { pictures.list = image; });
    render.makeThumbnail(saved.get(), false);
    render.makeThumbnail(saved.get(), true);
    if (QTest::qWaitFor([&render] { return render.makePictureThreadIsFinished(); }, PATIENCE_MS))
        pictures.air = QImage(canvas.folder.path() + "/title_1920.png");
    return pictures;
}

QImage tst_thumbnailrender_canvas::onGrey(const QImage& image, QSize size)
{
    QImage result(size, QImage::Format_RGB32);
    result.fill(QColor(128, 128, 128));
    QPainter painter(&result);
    painter.drawImage(0, 0, image.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
    return result;
}

double tst_thumbnailrender_canvas::worstCell(const QImage& a, const QImage& b, int cell)
{
    double worst = 0.0;
    for (int y = 0; y + cell <= a.height(); y += cell) {
        for (int x = 0; x + cell <= a.width(); x += cell) {
            int sums[3] = {0, 0, 0};
            for (int dy = 0; dy < cell; ++dy) {
                for (int dx = 0; dx < cell; ++dx) {
                    const QRgb p = a.pixel(x + dx, y + dy);
                    const QRgb q = b.pixel(x + dx, y + dy);
                    sums[0] += qRed(p) - qRed(q);
                    sums[1] += qGreen(p) - qGreen(q);
                    sums[2] += qBlue(p) - qBlue(q);
                }
            }
            for (const int sum : sums)
                worst = qMax(worst, qAbs(sum) / double(cell * cell));
        }
    }
    return worst;
}

QRect tst_thumbnailrender_canvas::ink(const QImage& image)
{
    QRect area;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            if (qAlpha(image.pixel(x, y)) > 100)
                area |= QRect(x, y, 1, 1);
    }
    return area;
}

void tst_thumbnailrender_canvas::compare(const Pictures& pictures, double tolerance, int edge)
{
    QCOMPARE(pictures.list.size(), QSize(240, 135));
    QCOMPARE(pictures.air.size(), QSize(1920, 1080));
    // Cells of 16 pixels of the canvas and of 3 of the list are the same area.
    const QImage canvas = onGrey(pictures.canvas, QSize(1280, 720));
    const QImage air = onGrey(pictures.air, QSize(1280, 720));
    const double onAir = worstCell(canvas, air, 16);
    const double inList =
        worstCell(onGrey(pictures.canvas, QSize(240, 135)), onGrey(pictures.list, QSize(240, 135)), 3);
    QVERIFY2(onAir <= tolerance, qPrintable(QString("on air %1").arg(onAir)));
    QVERIFY2(inList <= tolerance, qPrintable(QString("in the list %1").arg(inList)));
    // Compares the edges of the ink, in canvas pixels.
    const QRect a = ink(pictures.canvas);
    const QRect b = ink(pictures.air);
    const QRectF scaled(b.x() / 1.5, b.y() / 1.5, b.width() / 1.5, b.height() / 1.5);
    const QString edges = QString("%1 %2 %3 %4 against %5 %6 %7 %8")
                              .arg(a.left())
                              .arg(a.top())
                              .arg(a.right() + 1)
                              .arg(a.bottom() + 1)
                              .arg(scaled.left())
                              .arg(scaled.top())
                              .arg(scaled.right())
                              .arg(scaled.bottom());
    QVERIFY2(qAbs(a.left() - scaled.left()) <= edge && qAbs(a.top() - scaled.top()) <= edge &&
                 qAbs(a.right() + 1 - scaled.right()) <= edge &&
                 qAbs(a.bottom() + 1 - scaled.bottom()) <= edge,
             qPrintable(edges));
}

void tst_thumbnailrender_canvas::everyProperty_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<int>("value");
    QTest::addColumn<double>("tolerance");
    QTest::addColumn<int>("edge");
    const char* names[] = {"family",     "size",        "bold",   "italic", "colour",  "edge",
                           "edge width", "edge colour", "shadow", "align",  "kerning", "position"};
    for (int id = 0; id < 12; ++id) {
        for (const int value : {0, 1}) {
            // The other rows show the property switched off.
            if (value == 1 && (id == 2 || id == 3 || id == 5))
                continue;
            // Shadows are lighter on the canvas; in pixels they are as wide as on the larger raster.
            const bool shadow = id == TextObjectConstants::PropertyShadow;
            QTest::addRow("%s %d", names[id], value)
                << id << value << (shadow ? 40.0 : 24.0) << (shadow ? 24 : 3);
        }
    }
}

void tst_thumbnailrender_canvas::everyProperty()
{
    QFETCH(int, id);
    QFETCH(int, value);
    QFETCH(double, tolerance);
    QFETCH(int, edge);
    const TText plain = makeRecord(QString::fromUtf8("Wide line\nnews"));
    TText styled = plain;
    StyleProperties::set(id, styled, value);
    if (m_plain.air.isNull())
        m_plain = picturesOf({plain});
    const Pictures& before = m_plain;
    const Pictures after = picturesOf({styled});
    compare(after, tolerance, edge);
    // The property is visible in all three pictures.
    QVERIFY(worstCell(onGrey(before.canvas, QSize(1280, 720)), onGrey(after.canvas, QSize(1280, 720)), 16) >
            10.0);
    QVERIFY(worstCell(onGrey(before.list, QSize(240, 135)), onGrey(after.list, QSize(240, 135)), 3) > 10.0);
    QVERIFY(worstCell(onGrey(before.air, QSize(1280, 720)), onGrey(after.air, QSize(1280, 720)), 16) > 10.0);
}

void tst_thumbnailrender_canvas::everyPlace()
{
    for (const QPointF place : {QPointF(-60.0, -40.0), QPointF(1100.0, 600.0), QPointF(0.5, 333.25)}) {
        TText record = makeRecord("Place");
        record.setXValue(float(place.x()));
        record.setYValue(float(place.y()));
        compare(picturesOf({record}), 24.0, 3);
        if (QTest::currentTestFailed())
            return;
    }
}

void tst_thumbnailrender_canvas::manyLinesAndScripts()
{
    TText first = makeRecord(QString::fromUtf8("快讯 News\nニュース\n속보 é"), 1, "DFHeiW5-A", 72);
    first.setXValue(20.0F);
    first.setYValue(20.0F);
    first.setTextAlign(0);
    TText second = makeRecord(QString::fromUtf8("Emoji 😀 e\u0301"), 2, "DejaVu Sans", 90);
    second.setXValue(500.0F);
    second.setYValue(400.0F);
    for (TextStyle* style : second.textItems()) {
        style->setIsTextEdge(1);
        style->setIsTextItalic(1);
    }
    compare(picturesOf({first, second}), 30.0, 3);
}

QTEST_MAIN(tst_thumbnailrender_canvas)
#include "tst_thumbnailrender_canvas.moc"

// Measures ink and makes long texts smaller.
#include "ListTexts.h"
#include "titlectl/TextFields.h"
#include "titlectl/TextFit.h"

#include "canvas/GraphicsText.h"
#include "canvas/TextObjectConstants.h"

#include <QGraphicsScene>
#include <QImage>
#include <QPainter>
#include <QtTest/QTest>
#include <algorithm>
#include <cmath>

namespace
{

// Returns the columns of pixels that the text covers in a picture, in canvas pixels. ratio: raster pixels per
// stored pixel.
double paintedWidth(const TText& text, double ratio, bool isBig)
{
    TText copy = text;
    QGraphicsScene scene;
    auto* item = new GraphicsText(&copy, 0);
    item->setRadio(ratio, isBig);
    item->initShowText();
    item->setPos(100.25, 100.0);
    scene.addItem(item);
    const QRect area = item->sceneBoundingRect().adjusted(-100, -100, 100, 100).toAlignedRect();
    QImage image(area.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    scene.render(&painter, QRectF(QPointF(), area.size()), area);
    painter.end();
    int first = image.width();
    int last = -1;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) > 0) {
                first = std::min(first, x);
                last = std::max(last, x);
            }
        }
    }
    return last < 0 ? 0.0 : (last - first + 1) * TextObjectConstants::SCENEPERCENTAGE / ratio;
}

double paintedWidth(const TText& text)
{
    return std::max(paintedWidth(text, TextObjectConstants::SCENEPERCENTAGE, false),
                    paintedWidth(text, 1.0, true));
}

TText name(int length, int size, int outline = -1)
{
    static const QString LETTERS =
        QString::fromUtf8("Wilhelmine Müller-Ångström von und zu Île d'Or 快讯 記者 속보 ");
    TText text = textOf({"x"});
    text.textItems().front()->setFontSize(size);
    if (outline >= 0) {
        TEdge edge;
        edge.setEdgeWidth(outline);
        text.textItems().front()->setIsTextEdge(1);
        text.textItems().front()->setTextEdge(edge);
    }
    QString value;
    while (value.size() < length)
        value += LETTERS;
    TextFields::replaceAll(text, value.left(length).trimmed());
    return text;
}

} // namespace

class tst_textfit : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void inkIsWhatIsPainted_data()
    {
        QTest::addColumn<int>("length");
        QTest::addColumn<int>("size");
        QTest::addColumn<int>("outline");
        for (const int length : {1, 5, 20, 60})
            for (const int size : {20, 40, 96, 150})
                for (const int outline : {-1, 0, 3})
                    QTest::addRow("%d of %d, outline %d", length, size, outline) << length << size << outline;
    }
    void inkIsWhatIsPainted()
    {
        QFETCH(int, length);
        QFETCH(int, size);
        QFETCH(int, outline);
        const TText text = name(length, size, outline);
        const double painted = paintedWidth(text);
        const double ink = TextFit::inkWidth(text);
        QVERIFY2(painted <= ink && ink <= painted + 6.0,
                 qPrintable(QStringLiteral("%1 %2").arg(painted).arg(ink)));
    }

    void nothingIsDrawn()
    {
        QCOMPARE(TextFit::inkWidth(textOf({" "})), 0.0);
        TText blank = textOf({"  \n "});
        QVERIFY(TextFit::shrink(blank, {1, 20}));
        QVERIFY(blank == textOf({"  \n "}));
    }

    void namesFit_data()
    {
        QTest::addColumn<int>("length");
        QTest::addColumn<int>("outline");
        for (int length = 5; length <= 60; length += 5)
            for (const int outline : {-1, 2})
                QTest::addRow("%d, outline %d", length, outline) << length << outline;
    }
    void namesFit()
    {
        QFETCH(int, length);
        QFETCH(int, outline);
        const TText before = name(length, 90, outline);
        TText text = before;
        const TemplateFields::Fit fit{600, 10};
        const bool wasFitting = TextFit::inkWidth(before) <= fit.width;
        QVERIFY(TextFit::shrink(text, fit));
        QVERIFY(paintedWidth(text) <= fit.width);
        if (wasFitting) {
            QVERIFY(text == before);
            return;
        }
        QVERIFY(text.textItems().front()->getFontSize() >= fit.smallest);
        // One step larger is too wide.
        TText larger = text;
        for (TextStyle* style : larger.textItems())
            style->setFontSize(style->getFontSize() + 1);
        QVERIFY(TextFit::inkWidth(larger) > fit.width);
    }

    void allRunsAlike()
    {
        TText text = textOf({"Wilhelmine", " von und zu "});
        text.textItems()[0]->setFontSize(120);
        text.textItems()[1]->setFontSize(60);
        QVERIFY(TextFit::shrink(text, {400, 10}));
        const int large = text.textItems().front()->getFontSize();
        const int small = text.textItems().back()->getFontSize();
        QVERIFY(large < 120);
        QCOMPARE(small, 60 * large / 120);
    }

    void smallest()
    {
        TText text = name(60, 90);
        QVERIFY(!TextFit::shrink(text, {300, 50}));
        QCOMPARE(text.textItems().front()->getFontSize(), 50);
        const TText before = name(60, 40);
        text = before;
        QVERIFY(!TextFit::shrink(text, {300, 50}));
        QVERIFY(text == before);
    }

    void alignment_data()
    {
        QTest::addColumn<int>("align");
        QTest::newRow("left") << -1;
        QTest::newRow("centre") << 0;
        QTest::newRow("right") << 1;
    }
    void alignment()
    {
        QFETCH(int, align);
        TText before = textOf({"Name of guest"});
        before.setTextAlign(align);
        TText text = before;
        TextFields::replaceAll(text, "An");
        TextFit::keepAlignment(text, before);
        const auto edge = [align](const TText& record) {
            TText copy = record;
            GraphicsText item(&copy, 0);
            item.initShowText();
            return record.getXValue() + item.layoutRect().width() * (align + 1) / 2.0;
        };
        QVERIFY(std::abs(edge(text) - edge(before)) < 0.01);
        QCOMPARE(text.getXValue() == before.getXValue(), align == -1);
    }
};

QTEST_MAIN(tst_textfit)
#include "tst_textfit.moc"

// Shapes of glyphs that are drawn from kept pictures, compared with their filled paths.
#include "canvas/GlyphMasks.h"
#include "canvas/GlyphPathCache.h"

#include <QFont>
#include <QImage>
#include <QPainter>
#include <QTest>
#include <functional>
#include <memory>

namespace
{

constexpr int PEN_WIDTH = 6;
const QColor COLOR(240, 200, 30);
const QColor EDGE_COLOR(20, 30, 120);

std::shared_ptr<const GlyphPath> glyph(const QString& text, int pixelSize = 60)
{
    QFont font(QStringLiteral("KST"));
    font.setPixelSize(pixelSize);
    return GlyphPathCache::glyph(font, text);
}

QImage drawn(QPointF baseline, const std::function<void(QPainter&)>& draw, QSize size = QSize(200, 120))
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(QColor(40, 90, 60));
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(baseline);
    draw(painter);
    return image;
}

// Returns the greatest difference of a channel.
int worst(const QImage& a, const QImage& b)
{
    int most = 0;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            const QRgb p = a.pixel(x, y);
            const QRgb q = b.pixel(x, y);
            most = qMax(most, qMax(qAbs(qRed(p) - qRed(q)),
                                   qMax(qAbs(qGreen(p) - qGreen(q)), qAbs(qBlue(p) - qBlue(q)))));
        }
    }
    return most;
}

} // namespace

class tst_glyphmasks : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void drawsWhatThePathDraws_data()
    {
        QTest::addColumn<QString>("text");
        for (const QString& text :
             {QStringLiteral("A"), QStringLiteral("g"), QStringLiteral("\u5feb"), QStringLiteral("e\u0301")})
            QTest::newRow(qPrintable(text)) << text;
    }

    void drawsWhatThePathDraws()
    {
        QFETCH(QString, text);
        const auto shape = glyph(text);
        for (int step = 0; step < 40; ++step) {
            const QPointF baseline(60 + step * 0.137, 80 - step * 0.31);
            const QImage byPath = drawn(baseline, [&](QPainter& painter) {
                painter.fillPath(shape->outline(PEN_WIDTH), EDGE_COLOR);
                painter.fillPath(shape->fill(), COLOR);
            });
            // Drawn for the first time, and from the kept picture.
            for (int time = 0; time < 2; ++time) {
                const QImage byMask = drawn(baseline, [&](QPainter& painter) {
                    GlyphMasks::fillOutline(painter, *shape, PEN_WIDTH, EDGE_COLOR);
                    GlyphMasks::fill(painter, *shape, COLOR);
                });
                const int difference = worst(byPath, byMask);
                QVERIFY2(difference <= 8, qPrintable(QString("%1 at step %2").arg(difference).arg(step)));
            }
        }
    }

    // A baseline left of or above the device has negative coordinates.
    void partsOutsideTheDevice()
    {
        const auto shape = glyph(QStringLiteral("W"));
        for (const QPointF baseline : {QPointF(-20.3, 20.7), QPointF(190.5, 119.9), QPointF(-500, -500)}) {
            const QImage byPath =
                drawn(baseline, [&](QPainter& painter) { painter.fillPath(shape->fill(), COLOR); });
            const QImage byMask =
                drawn(baseline, [&](QPainter& painter) { GlyphMasks::fill(painter, *shape, COLOR); });
            QVERIFY(worst(byPath, byMask) <= 8);
        }
    }

    void eachColourAndPenHasItsPicture()
    {
        const auto shape = glyph(QStringLiteral("B"));
        const auto filled = [&](const QColor& color) {
            return drawn({60, 80}, [&](QPainter& painter) { GlyphMasks::fill(painter, *shape, color); });
        };
        const auto outlined = [&](int penWidth) {
            return drawn({60, 80}, [&](QPainter& painter) {
                GlyphMasks::fillOutline(painter, *shape, penWidth, COLOR);
            });
        };
        QVERIFY(filled(COLOR) != filled(EDGE_COLOR));
        QVERIFY(outlined(2) != outlined(9));
        QVERIFY(outlined(2) != filled(COLOR));
        QColor translucent = COLOR;
        translucent.setAlpha(90);
        const QImage byPath =
            drawn({60, 80}, [&](QPainter& painter) { painter.fillPath(shape->fill(), translucent); });
        QVERIFY(worst(filled(translucent), byPath) <= 8);
    }

    void clipAndOpacityHold()
    {
        const auto shape = glyph(QStringLiteral("H"));
        const auto picture = [&](bool byMask) {
            return drawn({60.2, 80.4}, [&](QPainter& painter) {
                painter.setClipRect(QRect(5, -40, 20, 25));
                painter.setOpacity(0.5);
                if (byMask)
                    GlyphMasks::fill(painter, *shape, COLOR);
                else
                    painter.fillPath(shape->fill(), COLOR);
            });
        };
        QVERIFY(worst(picture(true), picture(false)) <= 8);
    }

    // A picture would be blurred, or would have other edges.
    void thePathIsDrawnWhereAPictureDoesNotServe_data()
    {
        using Prepare = std::function<void(QPainter&)>;
        QTest::addColumn<Prepare>("prepare");
        QTest::newRow("larger") << Prepare([](QPainter& painter) { painter.scale(1.5, 1.5); });
        QTest::newRow("turned") << Prepare([](QPainter& painter) { painter.rotate(20); });
        QTest::newRow("without antialiasing")
            << Prepare([](QPainter& painter) { painter.setRenderHint(QPainter::Antialiasing, false); });
    }

    void thePathIsDrawnWhereAPictureDoesNotServe()
    {
        QFETCH(std::function<void(QPainter&)>, prepare);
        const auto shape = glyph(QStringLiteral("K"));
        const auto picture = [&](bool byMask) {
            return drawn({60.2, 80.4}, [&](QPainter& painter) {
                prepare(painter);
                if (byMask)
                    GlyphMasks::fill(painter, *shape, COLOR);
                else
                    painter.fillPath(shape->fill(), COLOR);
            });
        };
        QCOMPARE(picture(true), picture(false));
    }

    void veryLargeShapes()
    {
        const auto shape = glyph(QStringLiteral("M"), 3000);
        const QSize size(3000, 2600);
        const QImage byPath = drawn(
            {10.5, 2400.5}, [&](QPainter& painter) { painter.fillPath(shape->fill(), COLOR); }, size);
        const QImage byMask = drawn(
            {10.5, 2400.5}, [&](QPainter& painter) { GlyphMasks::fill(painter, *shape, COLOR); }, size);
        QCOMPARE(byMask, byPath);
    }

    // More pictures than are kept.
    void picturesAreForgotten()
    {
        const auto shape = glyph(QStringLiteral("@"), 400);
        for (int step = 0; step < 64; ++step) {
            const QPointF baseline(20 + step / 64.0, 400 + step / 64.0);
            const QImage byMask = drawn(
                baseline, [&](QPainter& painter) { GlyphMasks::fill(painter, *shape, COLOR); },
                QSize(500, 500));
            if (step % 16 != 0)
                continue;
            const QImage byPath = drawn(
                baseline, [&](QPainter& painter) { painter.fillPath(shape->fill(), COLOR); },
                QSize(500, 500));
            QVERIFY(worst(byPath, byMask) <= 8);
        }
    }
};

QTEST_MAIN(tst_glyphmasks)
#include "tst_glyphmasks.moc"

#include "appliance/SampleBackgrounds.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPolygonF>
#include <QRadialGradient>
#include <QRandomGenerator>
#include <array>

namespace
{

constexpr int WIDTH = 1920;
constexpr int HEIGHT = 1080;
constexpr int CHECKER_SQUARE = 15;

QImage transparentPicture()
{
    QImage image(WIDTH, HEIGHT, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    return image;
}

void paintBar(QPainter& painter, int top, int alpha)
{
    QLinearGradient bar(0, top, 0, HEIGHT);
    bar.setColorAt(0, QColor(12, 30, 78, alpha));
    bar.setColorAt(1, QColor(4, 10, 30, alpha));
    painter.fillRect(0, top, WIDTH, HEIGHT - top, bar);
    painter.fillRect(0, top, WIDTH, 6, QColor(230, 168, 23, alpha));
}

// Paints one row of buildings from left to right; distant rows are paler and have fewer lit windows.
void paintBuildings(QPainter& painter, QRandomGenerator& random, const QColor& wall, int ground, int tallest,
                    int litPercent)
{
    int left = -20;
    while (left < WIDTH) {
        const int width = random.bounded(80, 170);
        const int height = random.bounded(tallest / 3, tallest);
        const QRect house(left, ground - height, width, height);
        painter.fillRect(house, wall);
        for (int y = house.top() + 16; y < ground - 12; y += 26) {
            for (int x = house.left() + 10; x < house.right() - 12; x += 22)
                if (random.bounded(100) < litPercent)
                    painter.fillRect(x, y, 10, 14, QColor(255, 214, 120, 200));
        }
        left += width + random.bounded(4, 24);
    }
}

} // namespace

QImage SampleBackgrounds::cityNight()
{
    QImage image(WIDTH, HEIGHT, QImage::Format_RGB32);
    QPainter painter(&image);
    QLinearGradient sky(0, 0, 0, 900);
    sky.setColorAt(0, QColor(8, 12, 40));
    sky.setColorAt(0.6, QColor(50, 44, 104));
    sky.setColorAt(1, QColor(196, 96, 88));
    painter.fillRect(image.rect(), sky);

    QRandomGenerator random(20240101U);
    for (int star = 0; star < 140; ++star) {
        painter.fillRect(random.bounded(WIDTH), random.bounded(420), 2, 2,
                         QColor(255, 255, 255, random.bounded(60, 220)));
    }
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(250, 240, 205));
    painter.drawEllipse(QPointF(1530, 190), 64, 64);
    painter.setRenderHint(QPainter::Antialiasing, false);

    paintBuildings(painter, random, QColor(48, 42, 84), 900, 520, 12);
    paintBuildings(painter, random, QColor(20, 20, 46), 900, 360, 34);
    paintBar(painter, 810, 235);
    return image;
}

QImage SampleBackgrounds::stageLights()
{
    QImage image(WIDTH, HEIGHT, QImage::Format_RGB32);
    image.fill(QColor(10, 8, 20));
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);

    struct Beam {
        int from;
        int to;
        QColor color;
    };
    const std::array<Beam, 5> beams{{{160, 620, QColor(90, 60, 220)},
                                     {560, 300, QColor(30, 150, 220)},
                                     {960, 980, QColor(230, 230, 250)},
                                     {1360, 1640, QColor(220, 60, 150)},
                                     {1760, 1280, QColor(240, 150, 40)}}};
    painter.setCompositionMode(QPainter::CompositionMode_Screen);
    for (const Beam& beam : beams) {
        QLinearGradient light(beam.from, 0, beam.to, HEIGHT);
        QColor faint = beam.color;
        faint.setAlpha(0);
        QColor strong = beam.color;
        strong.setAlpha(190);
        light.setColorAt(0, strong);
        light.setColorAt(1, faint);
        painter.setBrush(light);
        painter.drawPolygon(QPolygonF({QPointF(beam.from - 24, 0), QPointF(beam.from + 24, 0),
                                       QPointF(beam.to + 240, HEIGHT), QPointF(beam.to - 240, HEIGHT)}));
    }
    painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
    QRadialGradient floor(960, HEIGHT, 1100);
    floor.setColorAt(0, QColor(120, 90, 160, 150));
    floor.setColorAt(1, QColor(10, 8, 20, 0));
    painter.fillRect(image.rect(), floor);
    return image;
}

QImage SampleBackgrounds::lowerThird()
{
    QImage image = transparentPicture();
    QPainter painter(&image);
    paintBar(painter, 810, 225);
    return image;
}

QImage SampleBackgrounds::checker(const QSize& size)
{
    QImage image(size, QImage::Format_RGB32);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x) {
            const bool light = ((x / CHECKER_SQUARE) + (y / CHECKER_SQUARE)) % 2 == 0;
            image.setPixel(x, y, light ? qRgb(153, 153, 153) : qRgb(102, 102, 102));
        }
    }
    return image;
}

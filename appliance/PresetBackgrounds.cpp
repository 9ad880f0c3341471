#include "appliance/PresetBackgrounds.h"

#include <QColor>
#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>
#include <QPolygonF>
#include <QRadialGradient>
#include <cmath>

namespace
{

// Coordinates are given on this raster, in multiples of three, so that edges are also sharp on the 1280 x 720
// raster.
constexpr int WIDTH = 1920;
constexpr int HEIGHT = 1080;

const QColor NAVY(10, 24, 54);
const QColor NAVY_LIGHT(26, 58, 112);
const QColor BLUE(41, 135, 242);
const QColor AMBER(255, 184, 28);
const QColor RED(206, 24, 44);
const QColor RED_DARK(150, 12, 30);
const QColor PAPER(246, 248, 252);
const QColor PAPER_SHADE(220, 227, 238);

QColor withAlpha(QColor color, int alpha)
{
    color.setAlpha(alpha);
    return color;
}

QImage painted(const QSize& raster, void (*paint)(QPainter&))
{
    QImage image(raster, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.scale(double(raster.width()) / WIDTH, double(raster.height()) / HEIGHT);
    paint(painter);
    return image;
}

// Paints a shadow that fades outwards, as if lit from above.
void softShadow(QPainter& painter, const QRectF& plate, double radius)
{
    constexpr int RINGS = 26;
    constexpr double REACH = 36;
    painter.save();
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(0, 0, 0, 5));
    for (int ring = 0; ring < RINGS; ++ring) {
        const double grow = REACH * std::pow((ring + 1.0) / RINGS, 1.8);
        painter.drawRoundedRect(plate.translated(0, 6).adjusted(-grow, -grow, grow, grow), radius + grow,
                                radius + grow);
    }
    painter.restore();
}

void fillDown(QPainter& painter, const QRectF& area, const QColor& top, const QColor& bottom)
{
    QLinearGradient face(area.topLeft(), area.bottomLeft());
    face.setColorAt(0, top);
    face.setColorAt(1, bottom);
    painter.fillRect(area, face);
}

// Fills the area with a gradient from opaque at the left to transparent at the right.
void fillFading(QPainter& painter, const QRectF& area, const QColor& color, double solidPart)
{
    QLinearGradient face(area.topLeft(), area.topRight());
    face.setColorAt(0, color);
    face.setColorAt(solidPart, color);
    face.setColorAt(1, withAlpha(color, 0));
    painter.fillRect(area, face);
}

void paintLowerThird(QPainter& painter)
{
    const QRectF plate(0, 762, 1857, 201);
    fillFading(painter, plate, withAlpha(NAVY, 236), 0.8);
    fillFading(painter, QRectF(0, 762, 1857, 3), withAlpha(BLUE, 255), 0.5);
    fillFading(painter, QRectF(0, 960, 1857, 3), withAlpha(NAVY_LIGHT, 255), 0.5);
    fillDown(painter, QRectF(156, 786, 12, 153), AMBER, AMBER.darker(120));
}

void paintStrap(QPainter& painter)
{
    const QRectF bar(0, 867, WIDTH, 105);
    softShadow(painter, bar, 0);
    fillDown(painter, bar, withAlpha(NAVY_LIGHT, 244), withAlpha(NAVY, 244));
    painter.fillRect(QRectF(0, 867, WIDTH, 3), withAlpha(PAPER, 70));
    painter.fillRect(QRectF(0, 972, WIDTH, 6), AMBER);
    QLinearGradient tag(0, 867, 0, 972);
    tag.setColorAt(0, RED);
    tag.setColorAt(1, RED_DARK);
    painter.setPen(Qt::NoPen);
    painter.setBrush(tag);
    painter.drawPolygon(QPolygonF({QPointF(0, 867), QPointF(582, 867), QPointF(531, 972), QPointF(0, 972)}));
    painter.setBrush(withAlpha(PAPER, 235));
    painter.drawPolygon(
        QPolygonF({QPointF(582, 867), QPointF(594, 867), QPointF(543, 972), QPointF(531, 972)}));
}

void paintFullScreen(QPainter& painter)
{
    const QRectF all(0, 0, WIDTH, HEIGHT);
    QRadialGradient ground(QPointF(1380, 390), 1500);
    ground.setColorAt(0, withAlpha(NAVY_LIGHT.lighter(115), 240));
    ground.setColorAt(0.55, withAlpha(NAVY, 248));
    ground.setColorAt(1, QColor(4, 10, 24, 252));
    painter.fillRect(all, ground);
    // Slanted ribbons; those nearer to the light are brighter.
    struct Ribbon {
        double left;
        double width;
        QColor color;
        int alpha;
    };
    const Ribbon ribbons[] = {{1230, 150, BLUE, 70},
                              {1398, 60, BLUE, 120},
                              {1476, 276, BLUE, 42},
                              {1770, 33, AMBER, 220},
                              {1821, 210, BLUE, 60}};
    constexpr double SLANT = 360;
    painter.setPen(Qt::NoPen);
    for (const Ribbon& ribbon : ribbons) {
        QLinearGradient fade(0, 0, 0, HEIGHT);
        fade.setColorAt(0, withAlpha(ribbon.color, ribbon.alpha));
        fade.setColorAt(1, withAlpha(ribbon.color, ribbon.alpha / 6));
        painter.setBrush(fade);
        painter.drawPolygon(QPolygonF({QPointF(ribbon.left, 0), QPointF(ribbon.left + ribbon.width, 0),
                                       QPointF(ribbon.left + ribbon.width - SLANT, HEIGHT),
                                       QPointF(ribbon.left - SLANT, HEIGHT)}));
    }
    painter.fillRect(QRectF(195, 711, 180, 9), AMBER);
}

// Returns one half of a quotation mark: a disk with a tail that curls up from its left side, in a box of 108
// by 150.
QPainterPath quotationHalf(double x, double y)
{
    QPainterPath mark;
    mark.moveTo(x + 102, y);
    mark.cubicTo(x + 42, y + 18, x, y + 60, x, y + 105);
    mark.arcTo(QRectF(x, y + 54, 99, 99), 180, 180);
    mark.arcTo(QRectF(x, y + 54, 99, 99), 0, 110);
    mark.cubicTo(x + 42, y + 48, x + 66, y + 30, x + 108, y + 18);
    mark.closeSubpath();
    return mark.simplified();
}

void paintQuote(QPainter& painter)
{
    const QRectF panel(282, 252, 1356, 576);
    softShadow(painter, panel, 18);
    QLinearGradient face(panel.topLeft(), panel.bottomLeft());
    face.setColorAt(0, withAlpha(NAVY_LIGHT, 232));
    face.setColorAt(1, withAlpha(NAVY, 240));
    painter.setPen(Qt::NoPen);
    painter.setBrush(face);
    painter.drawRoundedRect(panel, 18, 18);
    QPainterPath clip;
    clip.addRoundedRect(panel, 18, 18);
    painter.setClipPath(clip);
    fillDown(painter, QRectF(282, 252, 18, 576), AMBER, AMBER.darker(125));
    painter.setClipping(false);
    painter.setBrush(AMBER);
    painter.drawPath(quotationHalf(366, 330));
    painter.drawPath(quotationHalf(492, 330));
    painter.fillRect(QRectF(678, 684, 96, 6), AMBER);
}

void paintNamePlate(QPainter& painter)
{
    const QRectF upper(192, 756, 876, 114);
    const QRectF lower(192, 870, 696, 75);
    softShadow(painter, lower, 0);
    softShadow(painter, upper, 0);
    fillDown(painter, lower, withAlpha(NAVY_LIGHT, 246), withAlpha(NAVY, 246));
    fillDown(painter, upper, withAlpha(PAPER, 250), withAlpha(PAPER_SHADE, 250));
    fillDown(painter, QRectF(168, 756, 24, 189), BLUE, BLUE.darker(150));
}

void paintCornerMark(QPainter& painter)
{
    const QRectF mark(1272, 108, 456, 78);
    softShadow(painter, mark, 12);
    QPainterPath clip;
    clip.addRoundedRect(mark, 12, 12);
    painter.setClipPath(clip);
    fillDown(painter, mark, withAlpha(NAVY_LIGHT, 226), withAlpha(NAVY, 232));
    fillDown(painter, QRectF(1272, 108, 186, 78), RED, RED_DARK);
    painter.setClipping(false);
    painter.setPen(Qt::NoPen);
    painter.setBrush(PAPER);
    painter.drawEllipse(QPointF(1305, 147), 12, 12);
}

void paintSidePanel(QPainter& painter)
{
    QLinearGradient face(1005, 0, WIDTH, 0);
    face.setColorAt(0, withAlpha(NAVY, 0));
    face.setColorAt(0.22, withAlpha(NAVY, 214));
    face.setColorAt(1, withAlpha(NAVY, 244));
    painter.fillRect(QRectF(1005, 0, WIDTH - 1005, HEIGHT), face);
    painter.fillRect(QRectF(1173, 369, 555, 3), withAlpha(PAPER, 90));
    painter.fillRect(QRectF(1173, 366, 150, 9), AMBER);
    painter.setPen(Qt::NoPen);
    painter.setBrush(AMBER);
    for (const double y : {480.0, 600.0, 720.0}) {
        painter.drawPolygon(
            QPolygonF({QPointF(1185, y - 12), QPointF(1197, y), QPointF(1185, y + 12), QPointF(1173, y)}));
    }
}

} // namespace

QImage PresetBackgrounds::lowerThird(const QSize& raster)
{
    return painted(raster, paintLowerThird);
}

QImage PresetBackgrounds::strap(const QSize& raster)
{
    return painted(raster, paintStrap);
}

QImage PresetBackgrounds::fullScreen(const QSize& raster)
{
    return painted(raster, paintFullScreen);
}

QImage PresetBackgrounds::quote(const QSize& raster)
{
    return painted(raster, paintQuote);
}

QImage PresetBackgrounds::namePlate(const QSize& raster)
{
    return painted(raster, paintNamePlate);
}

QImage PresetBackgrounds::cornerMark(const QSize& raster)
{
    return painted(raster, paintCornerMark);
}

QImage PresetBackgrounds::sidePanel(const QSize& raster)
{
    return painted(raster, paintSidePanel);
}

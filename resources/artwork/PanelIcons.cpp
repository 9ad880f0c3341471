#include "resources/artwork/PanelIcons.h"

#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Icons.h"

#include <QPainter>
#include <QPainterPath>
#include <QPolygonF>

#include <cmath>

namespace
{

// A capital A between two feet on a base line.
void letterA(QPainter& painter, qreal left, qreal right, qreal top, qreal base)
{
    const qreal middle = (left + right) / 2;
    painter.drawPolyline(QPolygonF({QPointF(left, base), QPointF(middle, top), QPointF(right, base)}));
    const qreal bar = qRound(top + (base - top) * 0.64);
    const qreal inset = (right - left) / 2 * (base - bar) / (base - top);
    painter.drawLine(QPointF(left + inset, bar), QPointF(right - inset, bar));
}

void arrow(QPainter& painter, const QPointF& from, const QPointF& to, qreal head)
{
    const QPointF along = (to - from) / std::hypot(to.x() - from.x(), to.y() - from.y());
    const QPointF across(-along.y(), along.x());
    painter.drawLine(from, to);
    painter.drawPolyline(
        QPolygonF({to - head * along + head * across, to, to - head * along - head * across}));
}

void letterPair(QPainter& painter)
{
    letterA(painter, 3, 15, 4, 19);
    painter.drawPolyline(QPolygonF({QPointF(21, 4), QPointF(27, 19), QPointF(33, 4)}));
}

// Turned about the middle of the box by quarters of a circle, clockwise.
void moveArrow(QPainter& painter, const QColor& color, int quarters)
{
    Icons::begin(painter, color);
    const qreal middle = Icons::ICON_BOX / 2.0;
    painter.translate(middle, middle);
    painter.rotate(90.0 * quarters);
    painter.translate(-middle, -middle);
    arrow(painter, QPointF(18, 31), QPointF(18, 5), 10);
}

enum class Side { Left, Center, Right };

void lines(QPainter& painter, const QColor& color, Side side)
{
    constexpr int LEFT = 4;
    constexpr int WIDTH = 28;
    Icons::begin(painter, color);
    int y = 6;
    for (const int length : {28, 18, 24, 14}) {
        const int free = WIDTH - length;
        const int x = LEFT + (side == Side::Left ? 0 : side == Side::Center ? free / 2 : free);
        painter.drawLine(QPointF(x, y), QPointF(x + length, y));
        y += 8;
    }
}

// A tile and, behind it, its shadow the given way.
void shadow(QPainter& painter, const QColor& color, int dx)
{
    constexpr int SIDE = 20;
    constexpr int DEPTH = 8;
    Icons::begin(painter, color);
    const QRectF tile(dx < 0 ? 12 : dx > 0 ? 4 : 8, 4, SIDE, SIDE);
    QPainterPath cast;
    cast.addRect(tile.translated(dx, DEPTH).adjusted(-1, 0, 1, 1));
    QPainterPath gap;
    gap.addRect(tile.adjusted(-3, -3, 3, 3));
    painter.fillPath(cast.subtracted(gap), color);
    painter.drawRect(tile);
}

} // namespace

void PanelIcons::sizeDown(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    letterA(painter, 4, 18, 13, 30);
    arrow(painter, QPointF(28, 13), QPointF(28, 30), 6);
}

void PanelIcons::sizeUp(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    letterA(painter, 2, 22, 6, 30);
    arrow(painter, QPointF(29, 23), QPointF(29, 6), 6);
}

void PanelIcons::kerningSmaller(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    letterPair(painter);
    arrow(painter, QPointF(3, 29), QPointF(15, 29), 5);
    arrow(painter, QPointF(33, 29), QPointF(21, 29), 5);
}

void PanelIcons::kerningLarger(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    letterPair(painter);
    arrow(painter, QPointF(15, 29), QPointF(3, 29), 5);
    arrow(painter, QPointF(21, 29), QPointF(33, 29), 5);
}

void PanelIcons::moveUp(QPainter& painter, const QColor& color)
{
    moveArrow(painter, color, 0);
}

void PanelIcons::moveRight(QPainter& painter, const QColor& color)
{
    moveArrow(painter, color, 1);
}

void PanelIcons::moveDown(QPainter& painter, const QColor& color)
{
    moveArrow(painter, color, 2);
}

void PanelIcons::moveLeft(QPainter& painter, const QColor& color)
{
    moveArrow(painter, color, 3);
}

void PanelIcons::alignLeft(QPainter& painter, const QColor& color)
{
    lines(painter, color, Side::Left);
}

void PanelIcons::alignCenter(QPainter& painter, const QColor& color)
{
    lines(painter, color, Side::Center);
}

void PanelIcons::alignRight(QPainter& painter, const QColor& color)
{
    lines(painter, color, Side::Right);
}

void PanelIcons::bold(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    QPainterPath letter;
    letter.moveTo(8, 5);
    letter.lineTo(19, 5);
    letter.cubicTo(29, 5, 29, 16, 23, 17.5);
    letter.cubicTo(32, 19, 31, 31, 20, 31);
    letter.lineTo(8, 31);
    letter.closeSubpath();
    QPainterPath upper;
    upper.moveTo(14, 10);
    upper.lineTo(18, 10);
    upper.cubicTo(22, 10, 22, 15, 18, 15);
    upper.lineTo(14, 15);
    upper.closeSubpath();
    QPainterPath lower;
    lower.moveTo(14, 20);
    lower.lineTo(19, 20);
    lower.cubicTo(24, 20, 24, 26, 19, 26);
    lower.lineTo(14, 26);
    lower.closeSubpath();
    painter.fillPath(letter.subtracted(upper).subtracted(lower), color);
}

void PanelIcons::italic(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    painter.drawLine(QPointF(15, 6), QPointF(29, 6));
    painter.drawLine(QPointF(7, 30), QPointF(21, 30));
    painter.drawLine(QPointF(22, 6), QPointF(14, 30));
}

void PanelIcons::none(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    painter.drawEllipse(QRectF(5, 5, 26, 26));
    painter.drawLine(QPointF(9, 27), QPointF(27, 9));
}

void PanelIcons::edge(QPainter& painter, const QColor& color)
{
    // A solid letter and the line around it.
    Icons::begin(painter, color);
    QPainterPath letter;
    letter.setFillRule(Qt::WindingFill);
    letter.addRect(8, 7, 20, 6);
    letter.addRect(15, 7, 6, 24);
    letter = letter.simplified();
    QPainterPathStroker around;
    around.setWidth(8);
    around.setJoinStyle(Qt::RoundJoin);
    painter.drawPath(around.createStroke(letter).united(letter).simplified());
    painter.fillPath(letter, color);
}

void PanelIcons::shadowRight(QPainter& painter, const QColor& color)
{
    shadow(painter, color, 8);
}

void PanelIcons::shadowCenter(QPainter& painter, const QColor& color)
{
    shadow(painter, color, 0);
}

void PanelIcons::shadowLeft(QPainter& painter, const QColor& color)
{
    shadow(painter, color, -8);
}

#include "resources/artwork/Icons.h"

#include "resources/artwork/DesignTokens.h"

#include <QPainter>
#include <QPainterPath>
#include <QPen>
#include <QPolygonF>

namespace
{

// An arrow that turns back to the left: a head, a shaft and a half circle behind it.
void turnBack(QPainter& painter, const QColor& color)
{
    Icons::begin(painter, color);
    QPainterPath shaft;
    shaft.moveTo(5, 13);
    shaft.lineTo(22, 13);
    shaft.arcTo(QRectF(13, 13, 18, 18), 90, -180);
    shaft.lineTo(12, 31);
    painter.drawPath(shaft);
    painter.drawPolyline(QPolygonF({QPointF(13, 5), QPointF(5, 13), QPointF(13, 21)}));
}

} // namespace

QPen Icons::linePen(const QColor& color)
{
    return QPen(color, Tokens::STROKE, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin);
}

void Icons::begin(QPainter& painter, const QColor& color)
{
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(linePen(color));
    painter.setBrush(Qt::NoBrush);
}

void Icons::folder(QPainter& painter, const QColor& color)
{
    begin(painter, color);
    QPainterPath back;
    back.moveTo(3, 29);
    back.lineTo(3, 9);
    back.quadTo(3, 7, 5, 7);
    back.lineTo(13, 7);
    back.lineTo(17, 11);
    back.lineTo(29, 11);
    back.quadTo(31, 11, 31, 13);
    back.lineTo(31, 16);
    painter.drawPath(back);
    QPainterPath front;
    front.moveTo(3, 30);
    front.lineTo(8, 16);
    front.lineTo(34, 16);
    front.lineTo(29, 30);
    front.closeSubpath();
    painter.drawPath(front);
}

void Icons::newText(QPainter& painter, const QColor& color)
{
    begin(painter, color);
    QPainterPath letter;
    letter.moveTo(3, 11);
    letter.lineTo(3, 6);
    letter.lineTo(25, 6);
    letter.lineTo(25, 11);
    letter.moveTo(14, 6);
    letter.lineTo(14, 30);
    letter.moveTo(10, 30);
    letter.lineTo(18, 30);
    painter.drawPath(letter);
    painter.drawLine(QPointF(28, 18), QPointF(28, 30));
    painter.drawLine(QPointF(22, 24), QPointF(34, 24));
}

void Icons::trash(QPainter& painter, const QColor& color)
{
    begin(painter, color);
    painter.drawLine(QPointF(5, 9), QPointF(31, 9));
    QPainterPath handle;
    handle.moveTo(13, 9);
    handle.lineTo(13, 4);
    handle.lineTo(23, 4);
    handle.lineTo(23, 9);
    painter.drawPath(handle);
    QPainterPath bin;
    bin.moveTo(8, 9);
    bin.lineTo(10, 32);
    bin.lineTo(26, 32);
    bin.lineTo(28, 9);
    painter.drawPath(bin);
    painter.drawLine(QPointF(15, 15), QPointF(15, 26));
    painter.drawLine(QPointF(21, 15), QPointF(21, 26));
}

void Icons::undo(QPainter& painter, const QColor& color)
{
    turnBack(painter, color);
}

void Icons::redo(QPainter& painter, const QColor& color)
{
    painter.translate(ICON_BOX, 0);
    painter.scale(-1, 1);
    turnBack(painter, color);
}

void Icons::safeArea(QPainter& painter, const QColor& color)
{
    begin(painter, color);
    painter.drawRect(QRectF(2, 6, 32, 24));
    QPen dashes = linePen(color);
    dashes.setCapStyle(Qt::FlatCap);
    dashes.setJoinStyle(Qt::MiterJoin);
    dashes.setDashPattern({2, 1.5});
    painter.setPen(dashes);
    painter.drawRect(QRectF(8, 12, 20, 12));
}

void Icons::canvasMenu(QPainter& painter, const QColor& color)
{
    begin(painter, color);
    painter.translate(-8, 0);
    painter.drawPolyline(QPolygonF({QPointF(41, 16), QPointF(46, 21), QPointF(51, 16)}));
    const QRectF frame(2, 6, 32, 24);
    painter.fillRect(QRectF(3, 7, 10, 11), color);
    painter.fillRect(QRectF(13, 18, 10, 11), color);
    painter.fillRect(QRectF(23, 7, 10, 11), color);
    painter.drawRect(frame);
}

void Icons::close(QPainter& painter, const QColor& color)
{
    begin(painter, color);
    painter.drawLine(QPointF(7, 7), QPointF(29, 29));
    painter.drawLine(QPointF(29, 7), QPointF(7, 29));
}

void Icons::smallFolder(QPainter& painter, const QColor& color)
{
    begin(painter, color);
    QPainterPath back;
    back.moveTo(3, 23);
    back.lineTo(3, 6);
    back.lineTo(10, 6);
    back.lineTo(13, 9);
    back.lineTo(23, 9);
    back.lineTo(23, 13);
    painter.drawPath(back);
    QPainterPath front;
    front.moveTo(3, 23);
    front.lineTo(7, 13);
    front.lineTo(27, 13);
    front.lineTo(23, 23);
    front.closeSubpath();
    painter.drawPath(front);
}

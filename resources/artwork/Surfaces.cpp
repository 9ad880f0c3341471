#include "resources/artwork/Surfaces.h"

#include "resources/artwork/DesignTokens.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>

namespace
{

QRectF insideLine(const QSize& size, qreal inset)
{
    return QRectF(inset, inset, size.width() - 2 * inset, size.height() - 2 * inset);
}

} // namespace

Surfaces::Face Surfaces::faceOf(Button state)
{
    switch (state) {
    case Button::Rest:
        return {Tokens::FACE_TOP, Tokens::FACE_BOTTOM, Tokens::OUTLINE, Tokens::FACE_LIGHT, Tokens::BORDER};
    case Button::Pressed:
        return {Tokens::FACE_PRESSED_TOP, Tokens::FACE_PRESSED_BOTTOM, Tokens::ACCENT, QColor(),
                Tokens::BORDER_PRESSED};
    case Button::Disabled:
        return {Tokens::FACE_DISABLED, Tokens::FACE_DISABLED, Tokens::OUTLINE_DISABLED, QColor(),
                Tokens::BORDER};
    case Button::SelectedRest:
        return {Tokens::SELECTED_TOP, Tokens::SELECTED_BOTTOM, Tokens::ACCENT, Tokens::SELECTED_LIGHT,
                Tokens::BORDER};
    case Button::SelectedPressed:
        return {Tokens::SELECTED_PRESSED_TOP, Tokens::SELECTED_PRESSED_BOTTOM, Tokens::ACCENT_LIGHT, QColor(),
                Tokens::BORDER_PRESSED};
    case Button::SelectedDisabled:
        return {Tokens::SELECTED_DISABLED, Tokens::SELECTED_DISABLED, Tokens::SELECTED_OUTLINE_DISABLED,
                QColor(), Tokens::BORDER};
    }
    return {};
}

void Surfaces::drawFace(QPainter& painter, const QSize& size, const Face& face, qreal radius)
{
    painter.setRenderHint(QPainter::Antialiasing);
    QLinearGradient gradient(0, 0, 0, size.height());
    gradient.setColorAt(0, face.top);
    gradient.setColorAt(1, face.bottom);
    painter.setPen(QPen(face.outline, face.border));
    painter.setBrush(gradient);
    painter.drawRoundedRect(insideLine(size, face.border / 2), radius, radius);
    if (face.light.isValid()) {
        painter.fillRect(QRectF(radius, face.border, size.width() - 2 * radius, Tokens::BORDER), face.light);
    }
}

void Surfaces::button(QPainter& painter, const QSize& size, Button state)
{
    drawFace(painter, size, faceOf(state), Tokens::RADIUS_BUTTON);
}

void Surfaces::toolPlate(QPainter& painter, const QSize& size, Button state)
{
    // The bar begins at the very edge of the pane: the plate keeps off it.
    constexpr int TOP = 3;
    constexpr int BOTTOM = 1;
    painter.translate(0, TOP);
    drawFace(painter, QSize(size.width(), size.height() - TOP - BOTTOM), faceOf(state), Tokens::RADIUS_PANE);
}

void Surfaces::switchSeparator(QPainter& painter, const QSize& size, bool enabled)
{
    const Face face = faceOf(enabled ? Button::Rest : Button::Disabled);
    QLinearGradient gradient(0, 0, 0, size.height());
    gradient.setColorAt(0, face.top);
    gradient.setColorAt(1, face.bottom);
    painter.fillRect(QRect(QPoint(0, 0), size), gradient);
    painter.fillRect(0, 0, size.width(), 1, face.outline);
    painter.fillRect(0, size.height() - 1, size.width(), 1, face.outline);
    painter.fillRect(0, 0, 1, size.height(), face.outline);
    painter.fillRect(size.width() - 1, 0, 1, size.height(), face.outline);
}

void Surfaces::pane(QPainter& painter, const QSize& size, const QColor& fill)
{
    drawFace(painter, size, {fill, fill, Tokens::EDGE_DARK, Tokens::EDGE_LIGHT, Tokens::BORDER},
             Tokens::RADIUS_PANE);
}

void Surfaces::dialog(QPainter& painter, const QSize& size)
{
    // Outline, a light rim inside it, the face: a dialog stands out from the pane behind it.
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(Tokens::OUTLINE);
    painter.drawRoundedRect(insideLine(size, 0), Tokens::RADIUS_PANE + 2, Tokens::RADIUS_PANE + 2);
    painter.setBrush(Tokens::EDGE_LIGHT);
    painter.drawRoundedRect(insideLine(size, 2), Tokens::RADIUS_PANE, Tokens::RADIUS_PANE);
    painter.setBrush(Tokens::DIALOG);
    painter.drawRoundedRect(insideLine(size, 3), Tokens::RADIUS_PANE - 1, Tokens::RADIUS_PANE - 1);
}

void Surfaces::selectionBar(QPainter& painter, const QSize& size)
{
    QLinearGradient gradient(0, 0, 0, size.height());
    gradient.setColorAt(0, Tokens::SELECTED_TOP);
    gradient.setColorAt(1, Tokens::SELECTED_BOTTOM);
    painter.fillRect(QRect(QPoint(0, 0), size), gradient);
}

void Surfaces::horizontalGroove(QPainter& painter, const QSize& size)
{
    const int half = size.height() / 2;
    painter.fillRect(0, 0, size.width(), half, Tokens::EDGE_DARK);
    painter.fillRect(0, half, size.width(), size.height() - half, Tokens::GROOVE_LIGHT);
}

void Surfaces::verticalGroove(QPainter& painter, const QSize& size)
{
    const int half = size.width() / 2;
    painter.fillRect(0, 0, half, size.height(), Tokens::EDGE_DARK);
    painter.fillRect(half, 0, size.width() - half, size.height(), Tokens::GROOVE_LIGHT);
}

void Surfaces::checker(QPainter& painter, const QRect& area, int cell, const QColor& first,
                       const QColor& second)
{
    painter.save();
    painter.setClipRect(area);
    painter.fillRect(area, second);
    for (int y = area.top(), row = 0; y <= area.bottom(); y += cell, ++row) {
        for (int x = area.left() + (row % 2) * cell; x <= area.right(); x += 2 * cell) {
            painter.fillRect(x, y, cell, cell, first);
        }
    }
    painter.restore();
}

void Surfaces::canvasFrame(QPainter& painter, const QRect& canvas)
{
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(Tokens::GROOVE_LIGHT);
    painter.drawRoundedRect(QRectF(canvas.adjusted(-8, -8, 8, 8)), Tokens::RADIUS_PANE, Tokens::RADIUS_PANE);
    painter.setBrush(Tokens::EDGE_DARK);
    painter.drawRoundedRect(QRectF(canvas.adjusted(-7, -7, 7, 7)), Tokens::RADIUS_PANE - 1,
                            Tokens::RADIUS_PANE - 1);
    painter.setRenderHint(QPainter::Antialiasing, false);
    painter.fillRect(canvas.adjusted(-1, -1, 1, 1), Qt::black);
    checker(painter, canvas, Tokens::CHECKER_CELL, Tokens::CHECKER_DARK, Tokens::CHECKER_LIGHT);
}

void Surfaces::caretHandle(QPainter& painter, const QSize& size, bool pressed)
{
    painter.setRenderHint(QPainter::Antialiasing);
    const qreal middle = size.width() / 2.0;
    const qreal radius = middle - 2.0;
    const QRectF circle(2.0, size.height() - 2.0 - 2 * radius, 2 * radius, 2 * radius);
    QPainterPath drop;
    drop.moveTo(middle, 0.5);
    drop.lineTo(middle + radius * 0.72, circle.top() + radius * 0.42);
    drop.lineTo(middle - radius * 0.72, circle.top() + radius * 0.42);
    drop.closeSubpath();
    QPainterPath round;
    round.addEllipse(circle);
    painter.setPen(QPen(pressed ? Tokens::TEXT_SELECTED : Tokens::TEXT, pressed ? 2.0 : 1.0));
    painter.setBrush(pressed ? Tokens::ACCENT_LIGHT : Tokens::ACCENT);
    painter.drawPath(drop.united(round));
}

void Surfaces::grid(QPainter& painter, const QSize& size)
{
    constexpr int MAJOR = 4; // every so many squares a brighter line
    painter.fillRect(QRect(QPoint(0, 0), size), Tokens::PANEL);
    for (const bool isMajor : {false, true}) {
        const QColor& color = isMajor ? Tokens::GRID_MAJOR : Tokens::GRID;
        for (int at = Tokens::GRID_CELL, index = 1; at < size.width(); at += Tokens::GRID_CELL, ++index) {
            if ((index % MAJOR == 0) == isMajor) {
                painter.fillRect(at, 0, 1, size.height(), color);
            }
        }
        for (int at = Tokens::GRID_CELL, index = 1; at < size.height(); at += Tokens::GRID_CELL, ++index) {
            if ((index % MAJOR == 0) == isMajor) {
                painter.fillRect(0, at, size.width(), 1, color);
            }
        }
    }
}

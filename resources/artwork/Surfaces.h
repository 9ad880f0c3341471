#pragma once

#include <QColor>
#include <QRect>
#include <QSize>

class QPainter;

// Faces of buttons, panes and rulers, painted from the origin over the given size.
namespace Surfaces
{

enum class Button { Rest, Pressed, Disabled, SelectedRest, SelectedPressed, SelectedDisabled };

struct Face {
    QColor top;
    QColor bottom;
    QColor outline;
    QColor light; // inside the upper edge; invalid for none
    qreal border;
};

Face faceOf(Button state);
void drawFace(QPainter& painter, const QSize& size, const Face& face, qreal radius);

void button(QPainter& painter, const QSize& size, Button state);
// The plate behind a button of the tools bar, which has none at rest.
void toolPlate(QPainter& painter, const QSize& size, Button state);
// What stands between two buttons of a switch.
void switchSeparator(QPainter& painter, const QSize& size, bool enabled);
void pane(QPainter& painter, const QSize& size, const QColor& fill);
void dialog(QPainter& painter, const QSize& size);
void selectionBar(QPainter& painter, const QSize& size);
// A groove of two lines, dark above light for a horizontal one.
void horizontalGroove(QPainter& painter, const QSize& size);
void verticalGroove(QPainter& painter, const QSize& size);
// The cell in the upper left corner is of the first colour.
void checker(QPainter& painter, const QRect& area, int cell, const QColor& first, const QColor& second);
// The canvas frame of the window; the canvas lies at the given rectangle.
void canvasFrame(QPainter& painter, const QRect& canvas);
// The handle under a text caret, its point up.
void caretHandle(QPainter& painter, const QSize& size, bool pressed);
// A panel ruled into squares.
void grid(QPainter& painter, const QSize& size);

} // namespace Surfaces

#pragma once

#include <QColor>
#include <QPen>

class QPainter;

// The icons, each in a box of ICON_BOX by ICON_BOX pixels whose upper left corner is the painter's origin.
// Lines are of one width and lie on whole pixels, so that they stay sharp.
namespace Icons
{

constexpr int ICON_BOX = 36;

QPen linePen(const QColor& color);
// Sets the pen of all icons.
void begin(QPainter& painter, const QColor& color);

void folder(QPainter& painter, const QColor& color);
void newText(QPainter& painter, const QColor& color);
void trash(QPainter& painter, const QColor& color);
void undo(QPainter& painter, const QColor& color);
void redo(QPainter& painter, const QColor& color);
void safeArea(QPainter& painter, const QColor& color);
// The canvas with the sign of a menu beside it; together they are wider than the box, and moved left to stay
// centred.
void canvasMenu(QPainter& painter, const QColor& color);
void close(QPainter& painter, const QColor& color);
// A folder for lists, in a box of 28 by 28.
void smallFolder(QPainter& painter, const QColor& color);

} // namespace Icons

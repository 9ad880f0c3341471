#pragma once

#include <QColor>

class QPainter;

// The icons of the text panel, each in the box of Icons::ICON_BOX.
namespace PanelIcons
{

void sizeDown(QPainter& painter, const QColor& color);
void sizeUp(QPainter& painter, const QColor& color);
void kerningSmaller(QPainter& painter, const QColor& color);
void kerningLarger(QPainter& painter, const QColor& color);
void moveUp(QPainter& painter, const QColor& color);
void moveRight(QPainter& painter, const QColor& color);
void moveDown(QPainter& painter, const QColor& color);
void moveLeft(QPainter& painter, const QColor& color);
void alignLeft(QPainter& painter, const QColor& color);
void alignCenter(QPainter& painter, const QColor& color);
void alignRight(QPainter& painter, const QColor& color);
void bold(QPainter& painter, const QColor& color);
void italic(QPainter& painter, const QColor& color);
// The sign of "none", for edge and shadow alike.
void none(QPainter& painter, const QColor& color);
void edge(QPainter& painter, const QColor& color);
void shadowRight(QPainter& painter, const QColor& color);
void shadowCenter(QPainter& painter, const QColor& color);
void shadowLeft(QPainter& painter, const QColor& color);

} // namespace PanelIcons

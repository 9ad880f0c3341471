#pragma once

#include "touchui/SliceFrame.h"

#include <QPixmap>
#include <QRect>

class QPainter;

// The three bands of a balloon, each of three pictures, with the picture that carries the arrow in the middle
// of the upper or the lower one. The arrow's picture is higher than its band and reaches out of the body.
namespace BalloonPainter
{

// The frame of the family ":/ToolTip/Balloon_Common_", and its arrows.
SliceFrame frame();
QPixmap arrowUp();
QPixmap arrowDown();

// One band, over the body's width: the arrow centred on arrowX where there is one; line is 0 upper, 1 middle,
// 2 lower.
void paintBand(QPainter& painter, const SliceFrame& frame, const QRect& body, int line,
               const QPixmap& arrow = QPixmap(), int arrowX = 0);

} // namespace BalloonPainter

#pragma once

#include "touchui/SliceFrame.h"

#include <QPixmap>
#include <QRect>

class QPainter;

// Paints balloons in three bands of three pictures each; the arrow's picture replaces the middle picture of
// the upper or lower band. It is higher than its band and extends beyond the body.
namespace BalloonPainter
{

// The pictures of the family ":/ToolTip/Balloon_Common_": the frame and its arrows.
SliceFrame frame();
QPixmap arrowUp();
QPixmap arrowDown();

// Paints one band over the width of the body, with the arrow, if there is one, centred on arrowX. line is 0
// for the upper band, 1 for the middle, 2 for the lower.
void paintBand(QPainter& painter, const SliceFrame& frame, const QRect& body, int line,
               const QPixmap& arrow = QPixmap(), int arrowX = 0);

} // namespace BalloonPainter

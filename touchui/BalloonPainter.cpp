#include "touchui/BalloonPainter.h"

#include <QPainter>

namespace BalloonPainter
{

SliceFrame frame()
{
    return SliceFrame(SliceFrame::family(QStringLiteral(":/ToolTip/Balloon_Common_")));
}

QPixmap arrowUp()
{
    return QPixmap(QStringLiteral(":/ToolTip/Balloon_Common_Upper_Center_Allow-02"));
}

QPixmap arrowDown()
{
    return QPixmap(QStringLiteral(":/ToolTip/Balloon_Common_Bottom_Center_Allow"));
}

void paintBand(QPainter& painter, const SliceFrame& frame, const QRect& body, int line, const QPixmap& arrow,
               int arrowX)
{
    const NineSlice::Cells cells = NineSlice::cells(body, frame.corners());
    const auto piece = [line](int column) { return static_cast<NineSlice::Piece>(line * 3 + column); };
    frame.paintPiece(painter, piece(0), cells[piece(0)]);
    frame.paintPiece(painter, piece(2), cells[piece(2)]);
    const QRect center = cells[piece(1)];
    if (arrow.isNull() || line == NineSlice::MiddleLeft / 3) {
        frame.paintPiece(painter, piece(1), center);
        return;
    }
    const int x = qBound(center.x(), arrowX - arrow.width() / 2,
                         qMax(center.x(), center.x() + center.width() - arrow.width()));
    frame.paintPiece(painter, piece(1), QRect(center.x(), center.y(), x - center.x(), center.height()));
    frame.paintPiece(painter, piece(1),
                     QRect(x + arrow.width(), center.y(), center.x() + center.width() - x - arrow.width(),
                           center.height()));
    // Align the inner edge of the arrow's picture with that of the band.
    const int y = line == 0 ? center.y() + center.height() - arrow.height() : center.y();
    painter.drawPixmap(x, y, arrow);
}

} // namespace BalloonPainter

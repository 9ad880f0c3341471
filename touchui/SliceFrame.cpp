#include "touchui/SliceFrame.h"

#include <QBitmap>
#include <QPainter>

SliceFrame::SliceFrame(const QStringList& paths)
{
    if (paths.size() != NineSlice::PieceCount)
        return;
    for (int i = 0; i < NineSlice::PieceCount; ++i)
        m_pieces[i].load(paths.at(i));
}

QStringList SliceFrame::family(const QString& prefix, const QString& bottom)
{
    QStringList paths;
    for (const QString& line : {QStringLiteral("Upper"), QStringLiteral("Middle"), bottom})
        for (const char* column : {"_Left", "_Center", "_Right"})
            paths.append(prefix + line + QLatin1String(column));
    return paths;
}

void SliceFrame::paint(QPainter& painter, const QRect& target) const
{
    const NineSlice::Cells cells = NineSlice::cells(target, corners());
    for (int i = 0; i < NineSlice::PieceCount; ++i)
        paintPiece(painter, static_cast<NineSlice::Piece>(i), cells[i]);
}

QRegion SliceFrame::mask(const QSize& size) const
{
    QPixmap shape(size);
    if (shape.isNull())
        return QRegion();
    shape.fill(Qt::transparent);
    QPainter painter(&shape);
    paint(painter, shape.rect());
    painter.end();
    return QRegion(shape.mask());
}

void SliceFrame::paintPiece(QPainter& painter, NineSlice::Piece piece, const QRect& target) const
{
    const QPixmap& picture = m_pieces[piece];
    if (picture.isNull() || target.isEmpty())
        return;
    // Smooth only the centre: edges are uniform in the direction in which they are stretched, and smoothing
    // would change their colours slightly and make the joints visible.
    const bool smooth = painter.testRenderHint(QPainter::SmoothPixmapTransform);
    painter.setRenderHint(QPainter::SmoothPixmapTransform, piece == NineSlice::MiddleCenter);
    painter.drawPixmap(target, picture);
    painter.setRenderHint(QPainter::SmoothPixmapTransform, smooth);
}

QMargins SliceFrame::corners() const
{
    return QMargins(m_pieces[NineSlice::UpperLeft].width(), m_pieces[NineSlice::UpperLeft].height(),
                    m_pieces[NineSlice::UpperRight].width(), m_pieces[NineSlice::BottomLeft].height());
}

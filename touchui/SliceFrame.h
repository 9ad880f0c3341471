#pragma once

#include "touchui/NineSlice.h"

#include <QPixmap>
#include <QRegion>
#include <QSize>
#include <QStringList>

#include <array>

class QPainter;

// A frame that is painted from nine pictures: corners in their natural size, the rest stretched between them.
// Missing pictures are not drawn.
class SliceFrame
{
public:
    SliceFrame() = default;
    // Nine resource paths in the order of NineSlice::Piece; with any other number the frame is empty.
    explicit SliceFrame(const QStringList& paths);

    // Returns the nine paths of a family: prefix + "Upper_Left" and so on; bottom is the word for the lower
    // row.
    static QStringList family(const QString& prefix, const QString& bottom = QStringLiteral("Bottom"));

    // target is in the painter's coordinates.
    void paint(QPainter& painter, const QRect& target) const;
    // Returns the opaque region of a frame of this size; empty for an empty frame. As the mask of a window it
    // gives round corners without a compositor, where transparent pixels would be black.
    QRegion mask(const QSize& size) const;
    void paintPiece(QPainter& painter, NineSlice::Piece piece, const QRect& target) const;

    const QPixmap& piece(NineSlice::Piece piece) const { return m_pieces[piece]; }
    QMargins corners() const;

private:
    std::array<QPixmap, NineSlice::PieceCount> m_pieces;
};

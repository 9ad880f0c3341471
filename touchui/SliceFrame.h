#pragma once

#include "touchui/NineSlice.h"

#include <QPixmap>
#include <QRegion>
#include <QSize>
#include <QStringList>

#include <array>

class QPainter;

// A frame that is painted from nine pictures: corners in their own size, the rest stretched between them. A
// picture that is missing leaves its piece undrawn.
class SliceFrame
{
public:
    SliceFrame() = default;
    // Nine resource paths in the order of NineSlice::Piece; another number leaves the frame empty.
    explicit SliceFrame(const QStringList& paths);

    // The nine paths of a family: prefix + "Upper_Left" and so on; bottom is how its lower row is spelt.
    static QStringList family(const QString& prefix, const QString& bottom = QStringLiteral("Bottom"));

    // In the painter's coordinates.
    void paint(QPainter& painter, const QRect& target) const;
    // What a frame of this size covers; empty for an empty frame. A window that has it for its mask is round
    // without a compositor, too, where what is transparent would be black.
    QRegion mask(const QSize& size) const;
    void paintPiece(QPainter& painter, NineSlice::Piece piece, const QRect& target) const;

    const QPixmap& piece(NineSlice::Piece piece) const { return m_pieces[piece]; }
    QMargins corners() const;
    bool isNull() const;

private:
    std::array<QPixmap, NineSlice::PieceCount> m_pieces;
};

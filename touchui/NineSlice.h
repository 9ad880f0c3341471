#pragma once

#include <QMargins>
#include <QRect>

#include <array>

// Calculates the rectangles of the pieces of a stretchable picture: pure functions. The rectangles cover the
// target without gaps and overlaps at every size. If the target is smaller than the corners, they shrink in
// proportion; for an empty target all rectangles are empty.
namespace NineSlice
{

enum Piece {
    UpperLeft,
    UpperCenter,
    UpperRight,
    MiddleLeft,
    MiddleCenter,
    MiddleRight,
    BottomLeft,
    BottomCenter,
    BottomRight,
    PieceCount
};

using Cells = std::array<QRect, PieceCount>;
using Triple = std::array<QRect, 3>;

// corners holds the natural widths of the left and right pieces and heights of the upper and lower pieces.
Cells cells(const QRect& target, const QMargins& corners);
// Returns the left, centre and right piece, all as high as the target.
Triple row(const QRect& target, int left, int right);
// Returns the top, centre and bottom piece, all as wide as the target.
Triple column(const QRect& target, int top, int bottom);

} // namespace NineSlice

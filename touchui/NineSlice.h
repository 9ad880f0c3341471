#pragma once

#include <QMargins>
#include <QRect>

#include <array>

// Where the pieces of a stretchable picture go: pure functions. The rectangles tile the target without gaps
// and without overlaps at every size; a target smaller than the corners shrinks these in proportion, and a
// target without area gives empty rectangles.
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

// corners: the natural widths of the left and right and heights of the upper and lower pieces.
Cells cells(const QRect& target, const QMargins& corners);
// Left, centre and right piece, all as high as the target.
Triple row(const QRect& target, int left, int right);
// Top, centre and bottom piece, all as wide as the target.
Triple column(const QRect& target, int top, int bottom);

} // namespace NineSlice

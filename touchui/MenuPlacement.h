#pragma once

#include <QPoint>
#include <QRect>
#include <QSize>

// Where a menu or a balloon goes beside what it belongs to, and where its arrow sits: pure functions.
// Anchors, bounds and results are in one coordinate space, the caller's; edges are half open, so a
// rectangle's lower edge is y + height.
namespace MenuPlacement
{

// How a menu stands to its anchor. With neither Below nor Above it stands over the anchor, arrow down.
enum Flag {
    Below = 1,       // its top under the anchor
    Above = 4,       // beside the anchor, most of it over it
    Horizontal = 32, // it starts at the anchor instead of being centred on it
};

enum class ArrowSide { Top, Bottom, Left, Right };

// The room that a menu leaves for its arrow on the arrow's side.
constexpr int ARROW_LENGTH = 12;
constexpr int ARROW_WIDTH = 24;
// An arrow keeps this far away from the corners.
constexpr int ARROW_INSET = 14;

struct Placement {
    QRect rect; // arrow included
    ArrowSide side = ArrowSide::Top;
    QPoint tip; // of the arrow, relative to rect
};

// The menu's upper edge.
int menuTop(int flags, int anchorY, int menuHeight, const QRect& bounds);
// The menu's left edge, within the bounds.
int menuLeft(int flags, int anchorX, int menuWidth, const QRect& bounds);
Placement placeMenu(int flags, const QPoint& anchor, const QSize& size, const QRect& bounds);
// A balloon over the anchor with the arrow down, or under it where there is no room above (or below is
// asked for and has room).
Placement placeBalloon(const QRect& anchor, const QSize& size, const QRect& bounds, bool below = false);

// What is left of a menu or balloon of the size without its arrow.
QRect background(const QSize& size, ArrowSide side);
// Row number index of count rows of equal height between the border lines of the background. The last row
// takes what does not divide.
QRect rowRect(const QRect& background, int border, int count, int index);
// The row at the point; -1 outside all.
int rowAt(const QRect& background, int border, int count, const QPoint& point);

} // namespace MenuPlacement

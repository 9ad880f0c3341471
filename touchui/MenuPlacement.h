#pragma once

#include <QPoint>
#include <QRect>
#include <QSize>

// Calculates the positions of menus and balloons beside their anchors, and of their arrows: pure functions.
// Anchors, bounds and results are in one coordinate space, which the caller chooses. Edges are half open: a
// rectangle's bottom edge is y + height.
namespace MenuPlacement
{

// Placement of a menu relative to its anchor. With neither Below nor Above it is above the anchor with the
// arrow down.
enum Flag {
    Below = 1,       // its top is at the anchor
    Above = 4,       // beside the anchor, mostly higher than it
    Horizontal = 32, // begins at the anchor instead of being centred on it
};

enum class ArrowSide { Top, Bottom, Left, Right };

// The space in pixels that a menu leaves for its arrow on the arrow's side.
constexpr int ARROW_LENGTH = 12;
constexpr int ARROW_WIDTH = 24;
// Least distance of an arrow from the corners, in pixels.
constexpr int ARROW_INSET = 14;

struct Placement {
    QRect rect; // including the arrow
    ArrowSide side = ArrowSide::Top;
    QPoint tip; // of the arrow, relative to rect
};

// Returns the top edge of a menu, within the bounds.
int menuTop(int flags, int anchorY, int menuHeight, const QRect& bounds);
// Returns the left edge of a menu, within the bounds.
int menuLeft(int flags, int anchorX, int menuWidth, const QRect& bounds);
Placement placeMenu(int flags, const QPoint& anchor, const QSize& size, const QRect& bounds);
// Places a balloon above the anchor with the arrow down, or below it if there is no room above, or if below
// is requested and has room.
Placement placeBalloon(const QRect& anchor, const QSize& size, const QRect& bounds, bool below = false);

// Returns the rectangle of a menu or balloon of this size without its arrow.
QRect background(const QSize& size, ArrowSide side);
// Returns the rectangle of one of count rows of equal height inside the border of the background. The last
// row includes the remainder of the division.
QRect rowRect(const QRect& background, int border, int count, int index);
// Returns the row at the point, or -1.
int rowAt(const QRect& background, int border, int count, const QPoint& point);

} // namespace MenuPlacement

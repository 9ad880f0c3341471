#pragma once

#include <QPoint>
#include <QPointF>
#include <QRect>
#include <QSize>

#include <optional>
#include <span>

// The arithmetic of lists that follow a finger and glide on after it is lifted: pure functions without timers
// or widgets.
//
// A list has a start point and an end point. The end point is the position of the finger. At each tick the
// start point moves towards the end point, and the list scrolls by half of the distance that was between
// them. While the finger is down, the start point covers half of the distance per tick, so the list follows
// closely; after the lift it covers a thirtieth, so the list glides to a stop. Points are in widget
// coordinates and lengths in pixels, with y downwards; a positive distance moves the content down. NaN counts
// as 0.
namespace FlickMotion
{

// Tap tolerance: a press that moves further than this (Manhattan length) is not a tap.
constexpr int TOUCH_SLOP = 20;
constexpr int MOUSE_SLOP = 5;

// The parameters in which lists differ.
struct Rules {
    qreal restDistance = 5.0;      // the motion ends if start and end are vertically at most this far apart
    int interval = 33;             // milliseconds between two ticks
    qreal flickDivisor = 30.0;     // in a flick, a tick covers this fraction (1 / n) of the distance
    int leastDrag = 0;             // least vertical distance of a drag step; 0 for no limit
    bool wholePixels = false;      // round points to whole pixels
    bool leastStepBoth = false;    // a flick also moves at least one pixel per tick horizontally
    bool dragStopsAtLimit = false; // a drag stops at an end of the list until the finger moves again
    bool firstMoveScrolls = false; // the first move of a finger scrolls the list, too
};

constexpr Rules scrollViewer()
{
    return {.dragStopsAtLimit = true};
}
constexpr Rules treeView()
{
    return {.leastDrag = 2, .wholePixels = true, .leastStepBoth = true};
}
// For the lists of combo boxes.
constexpr Rules comboList()
{
    return {.leastDrag = 2, .wholePixels = true, .leastStepBoth = true, .firstMoveScrolls = true};
}
constexpr Rules templateGrid()
{
    return {.wholePixels = true, .dragStopsAtLimit = true};
}

// The item under the finger, which a drag must not push out of the viewer. Viewer coordinates: top is the
// first row of the item, bottom the last; the viewer has viewerHeight rows.
struct DragBounds {
    int top = 0;
    int bottom = 0;
    int viewerHeight = 0;
};

struct Step {
    QPointF start;        // the new start point
    QPointF distance;     // by how much the content moves
    int scroll = 0;       // vertical part in whole pixels, truncated
    bool bounded = false; // the bounds have reduced the distance
};

// Truncates to whole pixels.
constexpr QPoint pixels(const QPointF& distance)
{
    return QPoint(int(distance.x()), int(distance.y()));
}

bool isFlickEnd(const Rules& rules, const QPointF& start, const QPointF& end);
// Calculates one tick while the finger is down.
Step dragStep(const Rules& rules, const QPointF& start, const QPointF& end,
              const std::optional<DragBounds>& bounds = std::nullopt);
// Calculates one tick after the finger was lifted.
Step flickStep(const Rules& rules, const QPointF& start, const QPointF& end);

// Limits a drag distance to the bounds; stores in bounded whether that changed it.
int boundedDistance(int distance, const DragBounds& bounds, bool* bounded = nullptr);
// Returns the scroll bar's value after the content has moved by offset, limited to the range.
int scrolledValue(int value, int offset, int minimum, int maximum);
// Returns whether the value is at an end of the range, where a flick stops.
constexpr bool isAtLimit(int value, int minimum, int maximum)
{
    return value == minimum || value == maximum;
}

bool isBeyondSlop(const QPointF& press, const QPointF& position, int slop);
// Returns whether the points are more than 20 pixels apart (Euclidean distance).
bool isMove(const QPointF& first, const QPointF& current);

// Returns the index at which a lifted item is dropped: before the first candidate whose top is at or below
// that of the lifted item, itemCount if it is below the last item of the list, otherwise oldIndex.
// candidateTops are the tops of consecutive items beginning with firstIndex; itemCount does not include the
// lifted item. Board coordinates.
int dropIndex(std::span<const int> candidateTops, int firstIndex, int itemCount, int liftedTop, int oldIndex);

// Scrolling at the edges while an item is lifted. top is the lifted item's first row in viewer coordinates;
// overhang is how far it extends below the viewer.
bool needsEdgeScroll(int top, int overhang);
int edgeScrollOffset(int top, int overhang);

// Returns the position of a floating widget that a finger drags to target but that must stay inside area: it
// slides along an edge, and stays where it is in a corner.
QPoint slideInside(const QPoint& target, const QPoint& current, const QRect& area, const QSize& size);

} // namespace FlickMotion

#pragma once

#include <QPoint>
#include <QPointF>
#include <QRect>
#include <QSize>

#include <optional>
#include <span>

// The arithmetic of lists that follow a finger and run on after it: pure functions, without timers or
// widgets.
//
// A list keeps a start point and an end point. The end point is the finger; at each tick the start point
// moves some of the way towards it and the list scrolls by half of what lay between. While the finger is down
// the start point covers half of the way at a tick, so the list follows closely; after it has left, a
// thirtieth, so the list glides and comes to rest. Points are in widget coordinates, lengths in pixels, y
// grows downwards; a positive distance moves the content down. Values that are no numbers count as 0.
namespace FlickMotion
{

// A finger that has strayed further than this (Manhattan length) from where it came down is no tap.
constexpr int TOUCH_SLOP = 20;
constexpr int MOUSE_SLOP = 5;

// In what lists differ.
struct Rules {
    qreal restDistance =
        5.0;           // start and end this near to each other vertically, included: the motion is over
    int interval = 33; // milliseconds between two ticks
    qreal flickDivisor = 30.0;     // the part of the way that the start point covers in a tick of a flick
    int leastDrag = 0;             // a drag's vertical distance is never shorter than this; 0 turns that off
    bool wholePixels = false;      // points have no fractions
    bool leastStepBoth = false;    // a flick moves the start point by at least a pixel horizontally, too
    bool dragStopsAtLimit = false; // at an end of the list a drag stops until the finger moves on
    bool firstMoveScrolls = false; // the way to the first move of a finger counts
};

constexpr Rules scrollViewer()
{
    return {.dragStopsAtLimit = true};
}
constexpr Rules treeView()
{
    return {.leastDrag = 2, .wholePixels = true, .leastStepBoth = true};
}
// The lists of combo boxes.
constexpr Rules comboList()
{
    return {.leastDrag = 2, .wholePixels = true, .leastStepBoth = true, .firstMoveScrolls = true};
}
constexpr Rules templateGrid()
{
    return {.wholePixels = true, .dragStopsAtLimit = true};
}

// The item under the finger, in coordinates of the viewer that shows viewerHeight rows: a drag does not push
// it out of the viewer. top is its first row, bottom its last.
struct DragBounds {
    int top = 0;
    int bottom = 0;
    int viewerHeight = 0;
};

struct Step {
    QPointF start;        // where the start point is now
    QPointF distance;     // by how much the content moves
    int scroll = 0;       // the vertical part in whole pixels, truncated
    bool bounded = false; // the bounds shortened the way
};

// Without the fractions.
constexpr QPoint pixels(const QPointF& distance)
{
    return QPoint(int(distance.x()), int(distance.y()));
}

bool isFlickEnd(const Rules& rules, const QPointF& start, const QPointF& end);
// One tick with the finger down.
Step dragStep(const Rules& rules, const QPointF& start, const QPointF& end,
              const std::optional<DragBounds>& bounds = std::nullopt);
// One tick after the finger has left.
Step flickStep(const Rules& rules, const QPointF& start, const QPointF& end);

// A drag distance kept within the bounds; bounded says whether that changed it.
int boundedDistance(int distance, const DragBounds& bounds, bool* bounded = nullptr);
// The scroll bar's value once the content has moved by the offset, within the range.
int scrolledValue(int value, int offset, int minimum, int maximum);
// Whether a flick dies here.
constexpr bool isAtLimit(int value, int minimum, int maximum)
{
    return value == minimum || value == maximum;
}

bool isBeyondSlop(const QPointF& press, const QPointF& position, int slop);
// Whether the straight distance is more than 20 pixels.
bool isMove(const QPointF& first, const QPointF& current);

// Where a lifted item drops: before the first candidate whose top is at or below the lifted item's, at
// itemCount when it is past the list's last item, else where it was. candidateTops are tops of consecutive
// items, the first of which has the index firstIndex; itemCount does not count the lifted item. All in board
// coordinates.
int dropIndex(std::span<const int> candidateTops, int firstIndex, int itemCount, int liftedTop, int oldIndex);

// Edge scrolling while an item is lifted. top is the lifted item's first row in viewer coordinates; overhang
// is how far its end lies below the viewer's.
bool needsEdgeScroll(int top, int overhang);
int edgeScrollOffset(int top, int overhang);

// Where a floating widget of the size goes when a finger drags it to target and it has to stay within the
// area: it slides along one edge, and stays where it is in a corner.
QPoint slideInside(const QPoint& target, const QPoint& current, const QRect& area, const QSize& size);

} // namespace FlickMotion

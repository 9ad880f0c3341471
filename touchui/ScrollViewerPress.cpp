#include "touchui/ScrollViewerPress.h"

#include "touchui/FlickMotion.h"

void ScrollViewerPress::begin(Pointer by, const QPoint& position, int value)
{
    hold.stop();
    popup.stop();
    pointer = by;
    press = position;
    last = position;
    current = position;
    valueAtPress = value;
    moved = false;
    outOfBounds = false;
    dragAreaPressed = false;
    positionInItem = QPoint(-1, -1);
}

void ScrollViewerPress::clearItem()
{
    item.clear();
    index = -1;
}

void ScrollViewerPress::stopTimers()
{
    hold.stop();
    popup.stop();
}

bool ScrollViewerPress::isBeyondSlop(const QPoint& position) const
{
    const int slop = pointer == Pointer::Mouse ? FlickMotion::MOUSE_SLOP : FlickMotion::TOUCH_SLOP;
    return FlickMotion::isBeyondSlop(press, position, slop);
}

void ScrollViewerPress::calculateBounds(int itemHeight, int viewerHeight)
{
    if (!item) {
        upperBound = 0;
        lowerBound = viewerHeight - 1;
        return;
    }
    upperBound = positionInItem.y();
    lowerBound = viewerHeight - (itemHeight - positionInItem.y());
}

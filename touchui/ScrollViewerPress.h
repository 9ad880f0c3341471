#pragma once

#include "touchui/KSBaseItemWidget.h"
#include "touchui/TouchTimer.h"

#include <QObject>
#include <QPoint>
#include <QPointer>

// The press under way on a scroll viewer: who does it, on which item, whether it is still a tap, may become a
// hold or the lifting of an item. Positions are in the viewer's coordinates unless said otherwise.
class ScrollViewerPress
{
public:
    static constexpr int HOLD_TIME = 700;  // ms
    static constexpr int POPUP_TIME = 50;  // ms on a drag handle until the item is lifted
    static constexpr int NO_TOUCH = -1;    // nothing is pressed
    static constexpr int MOUSE_TOUCH = -2; // the mouse is

    // A press by the touch point (or MOUSE_TOUCH). value is the scroll bar's.
    void begin(int touchId, const QPoint& position, int value);
    // The press does not count any more: its end does nothing.
    void drop() { touchId = NO_TOUCH; }
    bool isActive() const { return touchId != NO_TOUCH; }
    void clearItem();
    void stopTimers();

    // Whether the press has left the room of a tap.
    bool isBeyondSlop(const QPoint& position) const;
    // Where the viewer's edges hold the item: the finger's lowest and highest y.
    void calculateBounds(int itemHeight, int viewerHeight);
    bool isOutside(int y) const { return y < upperBound || y > lowerBound; }

    int touchId = NO_TOUCH;
    QPointer<QObject> object; // under the finger; the mouse stays out while there is one
    QPointer<KSBaseItemWidget> item;
    int index = -1;
    QPoint positionInItem = QPoint(-1, -1); // in item coordinates
    QPoint press;
    QPoint last;
    int valueAtPress = 0;
    int upperBound = 0;
    int lowerBound = 0;
    bool moved = false; // the list has scrolled since the press
    bool willFlick = false;
    bool outOfBounds = false;
    bool dragAreaPressed = false;
    bool popupRequested = false;
    TouchTimer hold;
    TouchTimer popup;
};

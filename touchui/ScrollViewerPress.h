#pragma once

#include "touchui/KSBaseItemWidget.h"
#include "touchui/TouchTimer.h"

#include <QPoint>
#include <QPointer>

// The press under way on a scroll viewer: who does it, on which item, whether it is still a tap, may become a
// hold or the lifting of an item. Positions are in the viewer's coordinates unless said otherwise.
class ScrollViewerPress
{
public:
    static constexpr int HOLD_TIME = 700; // ms
    static constexpr int POPUP_TIME = 50; // ms on a drag handle until the item is lifted
    // Who presses.
    enum class Pointer { None, Finger, Mouse };

    // value is the scroll bar's.
    void begin(Pointer by, const QPoint& position, int value);
    // The press does not count any more: its end does nothing.
    void drop() { pointer = Pointer::None; }
    bool isActive() const { return pointer != Pointer::None; }
    void clearItem();
    void stopTimers();

    // Whether the press has left the room of a tap.
    bool isBeyondSlop(const QPoint& position) const;
    // Where the viewer's edges hold the item: the finger's lowest and highest y.
    void calculateBounds(int itemHeight, int viewerHeight);
    bool isOutside(int y) const { return y < upperBound || y > lowerBound; }

    Pointer pointer = Pointer::None;
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

#pragma once

#include "touchui/KSBaseItemWidget.h"
#include "touchui/TouchTimer.h"

#include <QPoint>
#include <QPointer>

// The current press on a scroll viewer: the pointer, the item, and whether the press is still a tap or may
// become a hold or lift the item. Positions are in the viewer's coordinates unless stated otherwise.
class ScrollViewerPress
{
public:
    static constexpr int HOLD_TIME = 700; // ms
    static constexpr int POPUP_TIME = 50; // ms of a press on a drag handle before the item is lifted
    // The device of the press.
    enum class Pointer { None, Finger, Mouse };

    // value is that of the scroll bar.
    void begin(Pointer by, const QPoint& position, int value);
    // Ends the press without any effect; its lift is ignored.
    void drop() { pointer = Pointer::None; }
    bool isActive() const { return pointer != Pointer::None; }
    void clearItem();
    void stopTimers();

    // Returns whether the press has moved further than a tap allows.
    bool isBeyondSlop(const QPoint& position) const;
    // Sets the lowest and highest y of the finger between which the pressed item stays inside the viewer.
    void calculateBounds(int itemHeight, int viewerHeight);
    bool isOutside(int y) const { return y < upperBound || y > lowerBound; }

    Pointer pointer = Pointer::None;
    QPointer<KSBaseItemWidget> item;
    int index = -1;
    QPoint positionInItem = QPoint(-1, -1); // in item coordinates
    QPoint press;
    QPoint last;    // up to where the list or the lifted item has followed
    QPoint current; // where the pointer was seen last
    int valueAtPress = 0;
    int upperBound = 0;
    int lowerBound = 0;
    bool moved = false; // the list has scrolled since the press began
    bool willFlick = false;
    bool outOfBounds = false;
    bool dragAreaPressed = false;
    TouchTimer hold;
    TouchTimer popup;
};

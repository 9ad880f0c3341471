#pragma once

#include "touchui/ElidedTextTip.h"
#include "touchui/Flicker.h"
#include "touchui/OneFinger.h"

#include <QObject>
#include <QPersistentModelIndex>
#include <QPoint>

class KSTreeView;
class QEvent;
class QMouseEvent;
class QRect;

// Handles the touch and mouse events of a tree: the flick, the press on a row, its check box or its
// indicator, the tap and the hold. A touch on a gliding tree only stops it.
//
// Positions are in viewport coordinates. GUI thread only.
class TreeTouch : public QObject
{
    Q_OBJECT
public:
    static constexpr int HOLD_INTERVAL = 700; // ms

    // The tree owns this object and must outlive it. Its scroll bars must exist before the first event.
    explicit TreeTouch(KSTreeView& tree);

    // Returns the meaning of a touch event for the finger; pass it on with the functions below.
    OneFinger::Step follow(const QTouchEvent* event) { return m_finger.follow(event); }
    void fingerPressed();
    void fingerMoved();
    void fingerLifted();
    // Ends the finger's press, after fingerLifted().
    void endFingerPress();
    // Handles an event of the viewport if it is a press, move, double click or release of the mouse; returns
    // whether it is. Mouse events of a disabled tree are not handled.
    bool takesMouse(QEvent* event);
    // Ends the press without a tap and stops any motion.
    void rest();
    // Ends the press without a tap.
    void cancelPress();

    Flicker& flicker() { return m_flicker; }
    void setHoldInterval(int milliseconds) { m_holdInterval = milliseconds; }
    // Restarts the timers that are running.
    void restartTimers();

    // Return whether the check box or the indicator of the row is pressed.
    bool isCheckBoxPressed(const QModelIndex& index) const;
    bool isIndicatorPressed(const QModelIndex& index) const;
    void releaseCheckBox();
    // Returns whether the tree and the row are enabled.
    bool isUsable(const QModelIndex& index) const;

Q_SIGNALS:
    // Emitted by a tap or a hold that has made the row current.
    void pressed(const QModelIndex& index);
    // Emitted, in this order and after pressed(), by a tap that has made the row current. The second is only
    // emitted if the row still exists.
    void currentChangedByTouch(const QModelIndex& index);
    void clicked(const QModelIndex& index);
    // Emitted when a row was held; it is the current row.
    void pressedAndHeld(const QModelIndex& index);

private:
    // Moved: the press has left the range of a tap. Held: it has ended as a hold.
    enum class Press { None, Down, Moved, Held };

    QPoint fingerPosition() const;
    void press(const QPoint& point);
    void beginPress(const QPoint& point);
    void followPress(const QPoint& point);
    void endPress(const QPoint& point);
    bool isBeyondSlop(const QPoint& point) const;
    void mousePressed(const QMouseEvent& event);
    void mouseMoved(const QMouseEvent& event);
    void mouseReleased(const QMouseEvent& event);
    void tap(const QPoint& point);
    void hold();
    void makeCurrent(const QModelIndex& index);
    void showElidedText(const QModelIndex& index);
    QRect indicatorArea(const QModelIndex& index) const;
    void startMotion();
    void showLastRowWhole();

    KSTreeView& m_tree;
    OneFinger m_finger;
    Flicker m_flicker;
    ElidedTextTip m_elidedText;
    int m_holdInterval = HOLD_INTERVAL;
    Press m_press = Press::None;
    QPoint m_pressPoint;
    QPersistentModelIndex m_pressedRow;
    QPersistentModelIndex m_pressedCheckBox;
    QPersistentModelIndex m_pressedIndicator;
};

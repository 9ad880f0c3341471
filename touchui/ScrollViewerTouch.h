#pragma once

#include "touchui/Flicker.h"
#include "touchui/KSBaseItemWidget.h"
#include "touchui/OneFinger.h"
#include "touchui/ScrollViewerDrag.h"
#include "touchui/ScrollViewerPress.h"

#include <QObject>
#include <QPoint>
#include <QPointF>

#include <optional>
#include <utility>

class KSScrollViewerWidget;
class QMouseEvent;
class QTouchEvent;
class ScrollViewerBoard;

// Handles touch and mouse events of a scroll viewer: the flick, the press on an item or an empty area, the
// hold, and the drag of an item by its handle.
//
// Positions are in coordinates of the list; in signals they are in coordinates of the item, or of the list if
// the item is null. GUI thread only.
class ScrollViewerTouch : public QObject
{
    Q_OBJECT
public:
    // Neither is owned; both must outlive this object. The list's scroll bar must exist before the first
    // event.
    ScrollViewerTouch(KSScrollViewerWidget& list, ScrollViewerBoard& board);

    // Handles a touch that was sent to the list, its viewport, an item or a widget in an item. Returns
    // whether the event needs no further handling.
    bool take(QObject* object, QTouchEvent* event);
    // Handles the finger's last event as a scroll motion. Returns whether the event needs no further
    // handling.
    bool followMotion();
    void passOnAsMouse();
    void fingerPressed(const QPoint& pos);
    void fingerMoved(const QPoint& pos);
    void fingerLifted(const QPoint& pos);
    void mousePressed(const QMouseEvent* event);
    void mouseMoved(const QMouseEvent* event);
    void mouseReleased(const QMouseEvent* event);
    // Ends the press without a tap or hold, stops any motion, and returns a lifted item to its position.
    void rest();

    Flicker& flicker() { return m_flicker; }
    const Flicker& flicker() const { return m_flicker; }
    // Calculates one tick; returns the distance by which the contents move.
    QPointF getDistance() { return m_flicker.advance(dragBounds()); }
    // Scrolls the contents down by offset pixels, within the range.
    void scrollBy(int offset);

    KSBaseItemWidget* pressedItem() const { return m_press.item; }
    // Returns whether the item is pressed or touched.
    bool isUsing(const KSBaseItemWidget* item) const;
    // Call when an item was removed from the list: ends the press on it and cancels its touch.
    void forget(const KSBaseItemWidget* item);
    // Cancels only the touch of the item, not its press.
    void breakTouchOf(const KSBaseItemWidget* item);
    void stopHold() { m_press.hold.stop(); }
    // Restarts the press and drag timers that are running.
    void restartTimers();

    // Sets the horizontal range outside of which presses select no item.
    void setEffectiveArea(int left, int width);
    // While set, the list does not handle touches that begin, but leaves them to the item under the finger.
    void setIsTake(bool isTake) { m_isTake = isTake; }
    // Returns the status that was set before.
    bool setMinitrimStatus(bool status) { return std::exchange(m_minitrim, status); }

    bool itemsCanDrag() const { return m_itemsCanDrag; }
    // Switching it off drops a lifted item.
    void setItemsCanDrag(bool canDrag);
    DragFlagAlignment dragAlignment() const { return m_dragAlignment; }
    // Applies to items that have no alignment of their own.
    void setDragAlignment(DragFlagAlignment alignment) { m_dragAlignment = alignment; }
    bool isDragging() const { return m_drag.isActive(); }
    // The widget under the finger, and the lifted item, which may be the same; null if no item is lifted.
    KSBaseItemWidget* movingWidget() const { return m_drag.moving(); }
    KSBaseItemWidget* liftedItem() const { return m_drag.item(); }
    // Lifts an item of the list, or the pressed item.
    void startDrag(KSBaseItemWidget* item);
    void startDrag();
    // Ends the drag without putting the lifted item back. For changes of the list during a drag.
    void abandonDrag();
    // Moves the placeholder to where the lifted item would be dropped now.
    void updateIndicator();

public Q_SLOTS:
    void reportHold();
    void scrollAtEdge();

Q_SIGNALS:
    void pressed(KSBaseItemWidget* item, QPoint pos);
    void rightPressed(KSBaseItemWidget* item, QPoint pos);
    void held(KSBaseItemWidget* item, QPoint pos);
    // Emitted when a press has moved further than a tap allows. If a receiver sets willFlick, the press does
    // not end as a tap.
    void flicked(KSBaseItemWidget* item, QPoint pos, bool& willFlick);
    void movedOver(KSBaseItemWidget* item, QPoint pos);
    void released(KSBaseItemWidget* item, QPoint pos);
    void releasedAfterMotion(KSBaseItemWidget* item, QPoint pos);
    void clicked(KSBaseItemWidget* item, QPoint pos);
    // Emitted when the mouse has moved further than a tap allows and may drag the list.
    void mouseDrags();
    // Emitted before the lifted item leaves the list.
    void dragStarts(KSBaseItemWidget* item, int index);
    void dragStarted();
    // Emitted when the item is back in the order; the list updates its layout.
    void dropped();

private:
    bool isOtherItemTouchWhenGraping(const QObject* object) const;
    void brake(const QPoint& pos);
    void motionEnded(Flicker::End end);
    std::optional<FlickMotion::DragBounds> dragBounds() const;
    int value() const;

    void beginPress(ScrollViewerPress::Pointer pointer, const QPoint& pos, Qt::MouseButton button);
    bool isItemDragAreaPressed() const;
    void startPress(Qt::MouseButton button, const wchar_t* tag);
    QPoint reportedPosition() const;
    void reportMove(const QPoint& pos);
    bool leavesTap(const QPoint& pos);
    void judgeMove(const QPoint& pos);
    bool isInsidePressedItem(const QPoint& pos) const;
    QPoint inPressedItem(const QPoint& pos) const;
    void moveAll(const QPoint& pos);
    void endPress(const QPoint& pos);
    void reportEnd(const QPoint& pos, bool moved);

    void moveDragItem(const QPoint& pos);
    int overhang() const;
    void dropItem();
    void dropAtRelease();

    KSScrollViewerWidget& m_list;
    ScrollViewerBoard& m_board;
    OneFinger m_finger;
    Flicker m_flicker;
    ScrollViewerPress m_press;
    ScrollViewerDrag m_drag;
    DragFlagAlignment m_dragAlignment = DRAGFLAG_NONE;
    int m_effectiveLeft = 0;
    int m_effectiveWidth = 0;
    bool m_savedMinitrim = false;
    bool m_minitrim = true;
    bool m_itemsCanDrag = false;
    bool m_isTake = false;
};

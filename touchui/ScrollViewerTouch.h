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

// What fingers and mouse do to a scroll viewer: the flick, the press on an item or beside it, the hold, and
// the drag of an item by its handle.
//
// Positions are in coordinates of the list; in signals they are the item's, or the list's when the item is
// null. GUI thread only.
class ScrollViewerTouch : public QObject
{
    Q_OBJECT
public:
    // Neither is owned; both outlive this object. The list's scroll bar is there by the time of the first
    // event.
    ScrollViewerTouch(KSScrollViewerWidget& list, ScrollViewerBoard& board);

    // Takes a touch that was sent to the list, its viewport, an item or a widget in an item. True when it
    // goes no further.
    bool take(QObject* object, QTouchEvent* event);
    // Follows the finger's last event. True when it belongs to the motion and goes no further.
    bool followMotion();
    void passOnAsMouse();
    void fingerPressed(const QPoint& pos);
    void fingerMoved(const QPoint& pos);
    void fingerLifted(const QPoint& pos);
    void mousePressed(const QMouseEvent* event);
    void mouseMoved(const QMouseEvent* event);
    void mouseReleased(const QMouseEvent* event);
    // Nothing is tapped or held, nothing goes on moving, and what is lifted returns to its place.
    void rest();

    Flicker& flicker() { return m_flicker; }
    const Flicker& flicker() const { return m_flicker; }
    // One tick: how far the contents move.
    QPointF getDistance() { return m_flicker.advance(dragBounds()); }
    // Scrolls the contents down by the offset, within the range.
    void scrollBy(int offset);

    KSBaseItemWidget* pressedItem() const { return m_press.item; }
    // Whether the item is pressed, or a finger is on it.
    bool isUsing(const KSBaseItemWidget* item) const;
    // For an item that has left the list: the press on it counts no more, and the finger gets no further.
    void forget(const KSBaseItemWidget* item);
    // Only the finger: others may come.
    void breakTouchOf(const KSBaseItemWidget* item);
    void stopHold() { m_press.hold.stop(); }
    // Restarts those timers of press and drag that run.
    void restartTimers();

    // Presses beside it select nothing.
    void setEffectiveArea(int left, int width);
    // While set, a touch is left to the item under it.
    void setIsTake(bool isTake) { m_isTake = isTake; }
    // Returns the old one.
    bool setMinitrimStatus(bool status) { return std::exchange(m_minitrim, status); }

    bool itemsCanDrag() const { return m_itemsCanDrag; }
    // Drops what is lifted when it is switched off.
    void setItemsCanDrag(bool canDrag);
    DragFlagAlignment dragAlignment() const { return m_dragAlignment; }
    // For items that have none of their own.
    void setDragAlignment(DragFlagAlignment alignment) { m_dragAlignment = alignment; }
    bool isDragging() const { return m_drag.isActive(); }
    // The widget under the finger, and the item that it is or stands for; null when nothing is lifted.
    KSBaseItemWidget* movingWidget() const { return m_drag.moving(); }
    KSBaseItemWidget* liftedItem() const { return m_drag.item(); }
    // Lifts an item of the list, or the one that is pressed.
    void startDrag(KSBaseItemWidget* item);
    void startDrag();
    // The list changes under the finger: what was lifted is not put back.
    void abandonDrag();
    // Moves the place that is kept for the lifted item to where it would drop now.
    void updateIndicator();

public Q_SLOTS:
    void reportHold();
    void scrollAtEdge();

Q_SIGNALS:
    void pressed(KSBaseItemWidget* item, QPoint pos);
    void rightPressed(KSBaseItemWidget* item, QPoint pos);
    void held(KSBaseItemWidget* item, QPoint pos);
    // A press has left the room of a tap. Who sets willFlick makes it one that ends in no tap.
    void flicked(KSBaseItemWidget* item, QPoint pos, bool& willFlick);
    void movedOver(KSBaseItemWidget* item, QPoint pos);
    void released(KSBaseItemWidget* item, QPoint pos);
    void releasedAfterMotion(KSBaseItemWidget* item, QPoint pos);
    void clicked(KSBaseItemWidget* item, QPoint pos);
    // The mouse has left the room of a tap and may drag the list.
    void mouseDrags();
    // Before the item leaves the list.
    void dragStarts(KSBaseItemWidget* item, int index);
    void dragStarted();
    // The item is back in the order: the list lays its items out.
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

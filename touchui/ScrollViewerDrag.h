#pragma once

#include "touchui/KSBaseItemWidget.h"
#include "touchui/TouchTimer.h"

#include <QPoint>
#include <QPointer>
#include <QSize>

#include <memory>

class ScrollViewerBoard;

// The drag of an item that was lifted out of a scroll viewer: the clone under the finger, the placeholder in
// the list, and the scrolling at the edges of the list.
class ScrollViewerDrag
{
public:
    static constexpr int SCROLL_TIME = 40; // ms between two scroll steps at an edge

    explicit ScrollViewerDrag(ScrollViewerBoard& board);
    ~ScrollViewerDrag();
    ScrollViewerDrag(const ScrollViewerDrag&) = delete;
    ScrollViewerDrag& operator=(const ScrollViewerDrag&) = delete;

    bool isActive() const { return m_active; }
    // The widget under the finger; null if no item is lifted.
    KSBaseItemWidget* moving() const { return m_moving; }
    KSBaseItemWidget* item() const { return m_item; }
    int dropIndex() const { return m_dropIndex; }
    // Sets the size of the placeholder.
    void setSize(const QSize& size) { m_size = size; }

    // Removes the item from the list and lets its clone float above the parent. position is in coordinates of
    // the parent.
    void lift(KSBaseItemWidget* item, DragFlagAlignment listAlignment, QWidget* parent,
              const QPoint& position);
    // Moves the clone vertically by dy pixels.
    void moveBy(int dy);
    // Moves the placeholder to where the item would be dropped. visible is the visible rectangle in board
    // coordinates; tall is true if the list is higher than the viewer. Returns whether the placeholder moved.
    bool updateIndicator(const QRect& visible, bool tall);
    // Returns the index at which the item would be dropped now.
    int getDropIndicatorID(const QRect& visible, bool tall) const;
    // Inserts the item at the placeholder and returns it; null if it was destroyed.
    KSBaseItemWidget* drop();
    // Sets the position of the drop to where the item was lifted.
    void returnToOrigin() { m_dropIndex = m_origin; }
    // Ends the drag without inserting the item.
    void abandon();
    // Hides the clone of the last drop, which is deleted by the next drag.
    void hideLastClone();

    // Returns the top of the floating widget in coordinates of the viewer.
    int topIn(const QWidget* viewer) const;
    int height() const;

    TouchTimer edgeTimer;

private:
    void keepLast(KSBaseItemWidget* clone);

    ScrollViewerBoard& m_board;
    QPointer<KSBaseItemWidget> m_item;
    QPointer<KSBaseItemWidget> m_moving; // m_item itself if it has no clone
    QPointer<KSBaseItemWidget> m_lastClone;
    QSize m_size;
    int m_origin = -1;
    int m_dropIndex = -1;
    bool m_active = false;
};

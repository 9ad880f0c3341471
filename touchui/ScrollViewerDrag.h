#pragma once

#include "touchui/KSBaseItemWidget.h"
#include "touchui/TouchTimer.h"

#include <QPoint>
#include <QPointer>
#include <QSize>

#include <memory>

class ScrollViewerBoard;

// An item that has been lifted out of a scroll viewer: the clone that floats under the finger, the place that
// is kept for it in the list, and the scrolling at the list's edges.
class ScrollViewerDrag
{
public:
    static constexpr int SCROLL_TIME = 40; // ms between two steps at an edge

    explicit ScrollViewerDrag(ScrollViewerBoard& board);
    ~ScrollViewerDrag();
    ScrollViewerDrag(const ScrollViewerDrag&) = delete;
    ScrollViewerDrag& operator=(const ScrollViewerDrag&) = delete;

    bool isActive() const { return m_active; }
    // The widget under the finger; null when nothing is lifted.
    KSBaseItemWidget* moving() const { return m_moving; }
    KSBaseItemWidget* item() const { return m_item; }
    int dropIndex() const { return m_dropIndex; }
    // The size of the place that is kept.
    void setSize(const QSize& size) { m_size = size; }

    // Takes the item, which is in the list, out of it and lets its clone float over the parent, whose
    // coordinates the position is in.
    void lift(KSBaseItemWidget* item, DragFlagAlignment listAlignment, QWidget* parent,
              const QPoint& position);
    // Clone and pointer part in y only.
    void moveBy(int dy);
    // Moves the kept place. visible is what is to be seen, in board coordinates; tall: the list does not fit.
    // True when it changed.
    bool updateIndicator(const QRect& visible, bool tall);
    // The place where the item would drop now.
    int getDropIndicatorID(const QRect& visible, bool tall) const;
    // Puts the item back into the list at the kept place and returns it; null when it is gone.
    KSBaseItemWidget* drop();
    // Moves the kept place to where the item was lifted.
    void returnToOrigin() { m_dropIndex = m_origin; }
    // Nothing is put back.
    void abandon();
    // The clone of the last drop, which the next drag deletes.
    void hideLastClone();

    // Position of the floating widget's top, in the coordinates of the viewer.
    int topIn(const QWidget* viewer) const;
    int height() const;

    TouchTimer edgeTimer;

private:
    void keepLast(KSBaseItemWidget* clone);

    ScrollViewerBoard& m_board;
    QPointer<KSBaseItemWidget> m_item;
    QPointer<KSBaseItemWidget> m_moving; // m_item itself when it has no clone
    QPointer<KSBaseItemWidget> m_lastClone;
    QSize m_size;
    int m_origin = -1;
    int m_dropIndex = -1;
    bool m_active = false;
};

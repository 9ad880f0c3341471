#pragma once

#include <QPointF>
#include <QRectF>
#include <QSizeF>

class QGraphicsItem;
class QGraphicsTextItem;

// Where a text object stands on the canvas and how far it may be moved. A pair is placed by its parent, the
// child staying at (0,0) in it; an object without a parent is placed itself. Scene coordinates of the 1280
// canvas unless said otherwise. GUI thread only.
class TextPlacement
{
public:
    // Side over which an object would leave the canvas.
    enum Side { Inside = 0, LeftSide = 1, RightSide = 2, TopSide = 3, BottomSide = 4 };

    // The item holds the text and outlives this object.
    explicit TextPlacement(QGraphicsTextItem& item);

    // The same for an object of the size at the position.
    static Side itemIsOutOfRange(QPointF position, QSizeF size);
    Side itemIsOutOfRange(QPointF position) const { return itemIsOutOfRange(position, area().size()); }
    // Places the object at the limit of that side. Returns the point from which the finger drags the
    // object on.
    QPointF adjustItemPos(Side side);

    bool isPair() const;
    // Of the item that places the object.
    QPointF place() const;
    void setPlace(QPointF place);
    // Of the text itself. It differs from place() while Qt drags the child.
    QPointF textPlace() const;
    // Places a pair, the child back in its parent; an object without a parent stays.
    void placePair(QPointF place);
    // Moves a pair to the side; an object without a parent stays.
    void shift(double distance);
    // Moves a pair as far as the finger moved, the child back into its parent.
    void followFinger(QPointF step);
    void setMovable(bool movable);

    // The rectangle of the layout, in item coordinates.
    QRectF area() const;
    QPointF mapToScene(QPointF point) const;

    // Whether the object was moved since this was last cleared.
    bool isMoved() const { return m_moved; }
    void markMoved() { m_moved = true; }
    void clearMoved() { m_moved = false; }

private:
    QGraphicsItem& placedItem() const;

    QGraphicsTextItem& m_item;
    bool m_moved = false;
};

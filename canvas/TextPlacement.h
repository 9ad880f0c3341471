#pragma once

#include <QPointF>
#include <QRectF>
#include <QSizeF>

class QGraphicsItem;
class QGraphicsTextItem;

// Places a text object on the canvas and limits how far it can be moved. A pair is placed by its parent, in
// which the child stays at (0,0); an object without a parent is placed itself. Scene coordinates of the 1280
// canvas unless said otherwise. GUI thread only.
class TextPlacement
{
public:
    // The side on which an object would leave the canvas.
    enum Side { Inside = 0, LeftSide = 1, RightSide = 2, TopSide = 3, BottomSide = 4 };

    // The item shows the text and must outlive this object.
    explicit TextPlacement(QGraphicsTextItem& item);

    // Returns the side for an object of the size at the position.
    static Side itemIsOutOfRange(QPointF position, QSizeF size);
    Side itemIsOutOfRange(QPointF position) const { return itemIsOutOfRange(position, area().size()); }
    // Places the object at the limit of that side. Returns the point from which the finger continues to drag
    // the object.
    QPointF adjustItemPos(Side side);

    bool isPair() const;
    // Returns the position of the item that places the object.
    QPointF place() const;
    void setPlace(QPointF place);
    // Returns the position of the child. It differs from place() while Qt drags the child.
    QPointF textPlace() const;
    // Places a pair and moves the child back to (0,0); does nothing without a parent.
    void placePair(QPointF place);
    // Moves a pair horizontally; does nothing without a parent.
    void shift(double distance);
    // Moves a pair by the step of the finger and the child back to (0,0).
    void followFinger(QPointF step);
    void setMovable(bool movable);

    // Returns the rectangle of the layout, in item coordinates.
    QRectF area() const;
    QPointF mapToScene(QPointF point) const;

    // Returns whether the object was moved since clearMoved().
    bool isMoved() const { return m_moved; }
    void markMoved() { m_moved = true; }
    void clearMoved() { m_moved = false; }

private:
    QGraphicsItem& placedItem() const;

    QGraphicsTextItem& m_item;
    bool m_moved = false;
};

#include "canvas/TextPlacement.h"

#include "canvas/TextObjectConstants.h"

#include <QGraphicsTextItem>

using namespace TextObjectConstants;

namespace
{

// How far the finger moves beyond the limits on the left and at the top before the object follows it.
constexpr double LEFT_RETURN_FACTOR = 2.0;
constexpr double TOP_RETURN_FACTOR = 3.0;

} // namespace

TextPlacement::TextPlacement(QGraphicsTextItem& item) : m_item(item)
{
}

QGraphicsItem& TextPlacement::placedItem() const
{
    QGraphicsItem* parent = m_item.parentItem();
    return parent ? *parent : m_item;
}

TextPlacement::Side TextPlacement::itemIsOutOfRange(QPointF position, QSizeF size)
{
    Side side = Inside;
    if (position.x() < SCENE_RECT.left() - (size.width() - LIMITEDNUM))
        side = LeftSide;
    else if (position.x() > SCENE_RECT.width() - LIMITEDNUM)
        side = RightSide;
    if (position.y() < SCENE_RECT.top() - (size.height() - LIMITEDNUM))
        side = TopSide;
    else if (position.y() > SCENE_RECT.height() - LIMITEDNUM)
        side = BottomSide;
    return side;
}

QPointF TextPlacement::adjustItemPos(Side side)
{
    QGraphicsItem& placed = placedItem();
    const QSizeF size = area().size();
    const QPointF before = placed.pos();
    QPointF reach;
    switch (side) {
    case LeftSide:
        placed.setX(SCENE_RECT.left() - (size.width() - LIMITEDNUM));
        reach.setX(LEFT_RETURN_FACTOR * (size.width() - LIMITEDNUM));
        break;
    case RightSide:
        placed.setX(SCENE_RECT.width() - LIMITEDNUM);
        break;
    case TopSide:
        placed.setY(SCENE_RECT.top() - (size.height() - LIMITEDNUM));
        reach.setY(TOP_RETURN_FACTOR * (size.height() - LIMITEDNUM));
        break;
    case BottomSide:
        placed.setY(SCENE_RECT.height() - LIMITEDNUM);
        break;
    case Inside:
        break;
    }
    if (placed.pos() != before)
        markMoved();
    return textPlace() + reach;
}

bool TextPlacement::isPair() const
{
    return m_item.parentItem() != nullptr;
}

QPointF TextPlacement::place() const
{
    return placedItem().pos();
}

void TextPlacement::setPlace(QPointF place)
{
    placedItem().setPos(place);
}

QPointF TextPlacement::textPlace() const
{
    return m_item.scenePos();
}

void TextPlacement::placePair(QPointF place)
{
    if (QGraphicsItem* parent = m_item.parentItem()) {
        parent->setPos(place);
        m_item.setPos(0.0, 0.0);
    }
}

void TextPlacement::shift(double distance)
{
    if (QGraphicsItem* parent = m_item.parentItem())
        parent->moveBy(distance, 0.0);
}

void TextPlacement::followFinger(QPointF step)
{
    if (QGraphicsItem* parent = m_item.parentItem()) {
        placePair(parent->scenePos() + step);
        parent->update();
    }
}

void TextPlacement::setMovable(bool movable)
{
    m_item.setFlag(QGraphicsItem::ItemIsMovable, movable);
}

QRectF TextPlacement::area() const
{
    return m_item.QGraphicsTextItem::boundingRect();
}

QPointF TextPlacement::mapToScene(QPointF point) const
{
    return m_item.mapToScene(point);
}

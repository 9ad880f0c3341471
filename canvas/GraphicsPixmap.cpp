#include "canvas/GraphicsPixmap.h"

#include <QPainter>

GraphicsPixmap::GraphicsPixmap(const QString& path, QGraphicsItem* parent)
    : QGraphicsPixmapItem(QPixmap(path), parent), m_path(path)
{
    setFlag(ItemIsMovable, false);
    setFlag(ItemIsSelectable, true);
    setFlag(ItemSendsGeometryChanges, true);
}

QRectF GraphicsPixmap::boundingRect() const
{
    return QRectF(pixmap().rect());
}

void GraphicsPixmap::paint(QPainter* painter, const QStyleOptionGraphicsItem*, QWidget*)
{
    if (!pixmap().isNull())
        painter->drawPixmap(boundingRect().toRect(), pixmap());
}

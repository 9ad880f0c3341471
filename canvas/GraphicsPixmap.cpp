#include "canvas/GraphicsPixmap.h"

#include "canvas/BackgroundPicture.h"

#include <QPainter>

GraphicsPixmap::GraphicsPixmap(const QString& path, QGraphicsItem* parent)
    : GraphicsPixmap(path, QPixmap(), parent)
{
    m_source = BackgroundPicture::load(path);
    setPixmap(m_source->pixmap());
}

GraphicsPixmap::GraphicsPixmap(const QString& path, const QPixmap& picture, QGraphicsItem* parent)
    : QGraphicsPixmapItem(picture, parent), m_path(path)
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

#include "canvas/GraphicsPixmap.h"

#include <QFileInfo>
#include <QPainter>

namespace
{

// Opening a pipe waits until somebody writes to it, and a device may never end.
QPixmap readPicture(const QString& path)
{
    const QFileInfo info(path);
    return info.exists() && !info.isFile() ? QPixmap() : QPixmap(path);
}

} // namespace

GraphicsPixmap::GraphicsPixmap(const QString& path, QGraphicsItem* parent)
    : QGraphicsPixmapItem(readPicture(path), parent), m_path(path)
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

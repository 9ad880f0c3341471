#include "canvas/GraphicsPixmap.h"

#include <QFileInfo>
#include <QImageReader>
#include <QPainter>

namespace
{

// Opening a pipe waits until somebody writes to it, and a device may never end. Read past the application's
// cache of pictures: a background is of no more use once its title is off the canvas, and four megabytes
// large.
QPixmap readPicture(const QString& path)
{
    if (!QFileInfo(path).isFile())
        return {};
    QImageReader reader(path);
    return QPixmap::fromImageReader(&reader);
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

#include "touchui/PictureIcon.h"

#include <QFile>
#include <QPainter>
#include <QPixmap>

const QIcon& PictureIcon::picture()
{
    if (!m_isRead) {
        m_isRead = true;
        m_picture = QIcon(QPixmap(m_path));
    }
    return m_picture;
}

void PictureIcon::paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State state)
{
    const qreal ratio = painter->device()->devicePixelRatio();
    painter->drawPixmap(rect, picture().pixmap(rect.size(), ratio, mode, state));
}

QPixmap PictureIcon::pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state)
{
    return picture().pixmap(size, mode, state);
}

QSize PictureIcon::actualSize(const QSize& size, QIcon::Mode mode, QIcon::State state)
{
    return picture().actualSize(size, mode, state);
}

QList<QSize> PictureIcon::availableSizes(QIcon::Mode mode, QIcon::State state)
{
    return picture().availableSizes(mode, state);
}

// Qt asks for this when the icon is set, so it does not decode the picture.
bool PictureIcon::isNull()
{
    return m_isRead ? m_picture.isNull() : !QFile::exists(m_path);
}

QIconEngine* PictureIcon::clone() const
{
    return new PictureIcon(*this);
}

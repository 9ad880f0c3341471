#include "library/TemplateThumbnail.h"

#include "document/PictureReader.h"

#include <QPainter>

QImage TemplateThumbnail::read(const QString& path)
{
    const PictureReader reader(path);
    const QSize size = reader.size();
    if (size.isEmpty() || qint64(size.width()) * size.height() > PIXEL_LIMIT)
        return {};
    const bool fits = size.width() <= SIZE.width() && size.height() <= SIZE.height();
    return reader.read(fits ? QSize() : size.scaled(SIZE, Qt::KeepAspectRatio).expandedTo(QSize(1, 1)));
}

QImage TemplateThumbnail::onChecker(const QImage& picture)
{
    QImage result(SIZE, QImage::Format_RGB32);
    QPainter painter(&result);
    painter.fillRect(result.rect(), QColor(102, 102, 102));
    painter.fillRect(result.rect(), QBrush(QPixmap(QStringLiteral(":/checker"))));
    const QSize left = SIZE - picture.size();
    painter.drawImage(left.width() / 2, left.height() / 2, picture);
    return result;
}

#include "library/CheckeredPicture.h"

#include <QBrush>
#include <QPainter>
#include <QPixmapCache>

namespace
{

const int CHECKER_SQUARE = 15; // pixels

QPixmap checkerPicture()
{
    const QPixmap checker(QStringLiteral(":/checker"));
    if (!checker.isNull())
        return checker;
    // Transparency has to differ from black even without the compiled-in picture.
    QPixmap drawn(2 * CHECKER_SQUARE, 2 * CHECKER_SQUARE);
    drawn.fill(QColor(102, 102, 102));
    QPainter painter(&drawn);
    painter.fillRect(0, 0, CHECKER_SQUARE, CHECKER_SQUARE, QColor(153, 153, 153));
    painter.fillRect(CHECKER_SQUARE, CHECKER_SQUARE, CHECKER_SQUARE, CHECKER_SQUARE, QColor(153, 153, 153));
    return drawn;
}

// Cached for all pictures: finding the picture among the resources takes longer than painting it.
QBrush checkerBrush()
{
    const QString key = QStringLiteral("CheckeredPicture pattern");
    QPixmap checker;
    if (!QPixmapCache::find(key, &checker)) {
        checker = checkerPicture();
        QPixmapCache::insert(key, checker);
    }
    return QBrush(checker);
}

} // namespace

CheckeredPicture::CheckeredPicture(QWidget* parent) : QWidget(parent)
{
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void CheckeredPicture::setPicture(const QPixmap& picture)
{
    m_picture = picture;
    update();
}

void CheckeredPicture::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    const bool isCovered = !m_picture.hasAlphaChannel() && m_picture.rect().contains(rect());
    if (!isCovered)
        painter.fillRect(rect(), checkerBrush());
    painter.drawPixmap(0, 0, m_picture);
}

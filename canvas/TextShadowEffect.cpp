#include "canvas/TextShadowEffect.h"

#include "canvas/GraphicsText.h"
#include "canvas/ShadowPainter.h"

#include <QPaintDevice>
#include <QPainter>
#include <QTextCursor>
#include <cmath>

namespace
{

// Pixels; twice the canvas. Most of a larger object is outside the view.
constexpr qint64 LARGEST_PICTURE = 2LL * 1480 * 920;

} // namespace

TextShadowEffect::TextShadowEffect(GraphicsText& item) : m_item(item)
{
}

bool TextShadowEffect::isWorthKeeping(const QPainter& painter) const
{
    return painter.device()->devType() == QInternal::Widget &&
           m_item.getBoundingLineStatus() != TextObjectConstants::FocusEdit &&
           !m_item.textCursor().hasSelection();
}

// The base class draws at the item's position on the device; here the picture is drawn at that position.
void TextShadowEffect::drawPicture(const QPainter& painter, QRect area)
{
    m_picture = QPixmap(area.size());
    m_picture.fill(Qt::transparent);
    QPainter picturePainter(&m_picture);
    picturePainter.setRenderHints(painter.renderHints());
    picturePainter.setWindow(area);
    drawOnce(picturePainter);
}

void TextShadowEffect::drawOnce(QPainter& painter)
{
    const ShadowPainter shadow(offset(), blurRadius(), color());
    QPoint place;
    QPixmap source;
    if (shadow.isServed())
        source = sourcePixmap(Qt::DeviceCoordinates, &place, PadToEffectiveBoundingRect);
    if (source.width() < 2 || source.height() < 2 || source.devicePixelRatio() != 1.0) {
        QGraphicsDropShadowEffect::draw(&painter);
        return;
    }
    const QTransform transform = painter.worldTransform();
    painter.setWorldTransform(QTransform());
    shadow.draw(painter, place, source);
    painter.setWorldTransform(transform);
}

void TextShadowEffect::draw(QPainter* painter)
{
    const QRect area = boundingRectFor(sourceBoundingRect(Qt::DeviceCoordinates)).toAlignedRect();
    if (!isWorthKeeping(*painter) || qint64(area.width()) * area.height() > LARGEST_PICTURE) {
        m_picture = QPixmap();
        drawOnce(*painter);
        return;
    }
    const QTransform transform = painter->worldTransform();
    const QPoint place(int(std::floor(transform.dx())), int(std::floor(transform.dy())));
    const Key key{m_item.contentVersion(), transform * QTransform::fromTranslate(-place.x(), -place.y()),
                  offset(), blurRadius(), color()};
    if (m_picture.isNull() || !(key == m_key)) {
        drawPicture(*painter, area);
        m_key = key;
        m_area = area.translated(-place);
    }
    painter->setWorldTransform(QTransform());
    painter->drawPixmap(m_area.topLeft() + place, m_picture);
    painter->setWorldTransform(transform);
}

#include "canvas/ShadowPainter.h"

#include "document/RasterPool.h"

#include <QImage>
#include <QPainter>
#include <algorithm>
#include <cstddef>
#include <vector>

// Declared here, since the widgets library exports it without a header. Qt's own effect blurs with it.
void qt_blurImage(QImage& image, qreal radius, bool quality, int transposed = 0);

namespace
{

constexpr double LEAST_RADIUS = 4.0; // Qt blurs less than this at full size
constexpr int BAND = 32;             // lines that are drawn at once, an even number

// Rounds down, as Qt does when it halves a picture.
constexpr int mean(int a, int b)
{
    return (a + b) >> 1;
}

// The alpha channel of a picture, which is blank around it.
class AlphaChannel
{
public:
    explicit AlphaChannel(const QImage& picture) : m_picture(picture) {}

    // Sets values to the alpha of the line from left on.
    void readLine(int y, int left, std::vector<uchar>& values) const
    {
        std::fill(values.begin(), values.end(), uchar(0));
        if (y < 0 || y >= m_picture.height())
            return;
        const auto* line = reinterpret_cast<const QRgb*>(m_picture.constScanLine(y));
        const int begin = std::max(0, -left);
        const int end = std::min(static_cast<int>(values.size()), m_picture.width() - left);
        for (int x = begin; x < end; ++x)
            values[static_cast<std::size_t>(x)] = static_cast<uchar>(line[left + x] >> 24);
    }

private:
    const QImage& m_picture;
};

// Returns whether the lines from top up to, but not including, bottom have nothing.
bool isBlank(const QImage& mask, int top, int bottom)
{
    for (int y = std::max(top, 0); y < std::min(bottom, mask.height()); ++y) {
        const uchar* line = mask.constScanLine(y);
        if (std::any_of(line, line + mask.width(), [](uchar value) { return value != 0; }))
            return false;
    }
    return true;
}

// Returns the mask as the alpha channel of a picture.
QImage pictureOf(const QImage& mask)
{
    QImage picture = RasterPool::take(mask.size());
    for (int y = 0; y < picture.height(); ++y) {
        const uchar* line = mask.constScanLine(y);
        std::transform(line, line + mask.width(), reinterpret_cast<QRgb*>(picture.scanLine(y)),
                       [](uchar alpha) { return QRgb(alpha) << 24; });
    }
    return picture;
}

} // namespace

ShadowPainter::ShadowPainter(QPointF offset, double blurRadius, const QColor& color)
    : m_offset(offset), m_blurRadius(blurRadius), m_color(color)
{
}

bool ShadowPainter::isServed() const
{
    return m_blurRadius >= LEAST_RADIUS && m_offset == QPointF(m_offset.toPoint());
}

// Returns the shadow's alpha at half the size.
QImage ShadowPainter::blurredMask(const QImage& picture) const
{
    const QPoint offset = m_offset.toPoint();
    const AlphaChannel alpha(picture);
    std::vector<uchar> upper(static_cast<std::size_t>(picture.width()));
    std::vector<uchar> lower(upper.size());
    // Qt blurs pictures of this format as masks.
    QImage mask(picture.width() / 2, picture.height() / 2, QImage::Format_Indexed8);
    for (int y = 0; y < mask.height(); ++y) {
        alpha.readLine(2 * y - offset.y(), -offset.x(), upper);
        alpha.readLine(2 * y + 1 - offset.y(), -offset.x(), lower);
        uchar* line = mask.scanLine(y);
        for (std::size_t x = 0; x + 1 < upper.size(); x += 2)
            line[x / 2] =
                static_cast<uchar>(mean(mean(upper[x], upper[x + 1]), mean(lower[x], lower[x + 1])));
    }
    qt_blurImage(mask, m_blurRadius / 2, false);
    return mask;
}

void ShadowPainter::draw(QPainter& painter, QPoint place, const QPixmap& picture) const
{
    const QImage source = picture.toImage();
    const QImage mask = blurredMask(source.convertToFormat(QImage::Format_ARGB32_Premultiplied));
    const QImage shadow = pictureOf(mask);
    QImage band = RasterPool::take({picture.width(), BAND});
    for (int top = 0; top < picture.height() && !shadow.isNull() && !band.isNull(); top += BAND) {
        if (isBlank(mask, top / 2 - 1, (top + BAND) / 2 + 1))
            continue;
        band.fill(Qt::transparent);
        QPainter bandPainter(&band);
        bandPainter.setRenderHint(QPainter::SmoothPixmapTransform);
        bandPainter.translate(0, -top);
        bandPainter.scale(2, 2);
        bandPainter.drawImage(shadow.rect(), shadow);
        bandPainter.resetTransform();
        bandPainter.setCompositionMode(QPainter::CompositionMode_SourceIn);
        bandPainter.fillRect(band.rect(), m_color);
        bandPainter.end();
        const int height = std::min(BAND, picture.height() - top);
        painter.drawImage(place + QPoint(0, top), band, QRect(0, 0, band.width(), height));
    }
    painter.drawPixmap(place, picture);
}

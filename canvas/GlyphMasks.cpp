#include "canvas/GlyphMasks.h"

#include "canvas/GlyphPathCache.h"

#include <QCache>
#include <QImage>
#include <QPaintEngine>
#include <QPainter>
#include <QPainterPath>
#include <QPoint>
#include <QTransform>
#include <cmath>
#include <memory>

namespace
{

constexpr int CACHE_BYTES = 16 * 1024 * 1024;
constexpr double LARGEST_PICTURE = 1024 * 1024; // pixels
constexpr double FARTHEST = 1 << 20;            // pixels, of a baseline from the device's origin
// Places within a pixel, in each direction. So many that a picture is what the path would be: the raster
// engine rounds to 1/64 pixel, and an object has few places at a time.
constexpr int PHASES = 1 << 24;

struct MaskKey {
    quint64 glyph;
    int penWidth;
    QRgb color;
    int phaseX;
    int phaseY;

    bool operator==(const MaskKey&) const = default;
};

size_t qHash(const MaskKey& key, size_t seed)
{
    return qHashMulti(seed, key.glyph, key.penWidth, key.color, key.phaseX, key.phaseY);
}

struct Mask {
    QImage image;
    QPoint offset; // of its corner from the whole pixel of the baseline
};

// A coordinate as a whole pixel and the phase in it.
struct Place {
    // Never beyond the value: the raster engine rounds up from the middle between two of its places.
    explicit Place(double value)
        : pixel(static_cast<int>(std::floor(value))), phase(static_cast<int>((value - pixel) * PHASES))
    {
    }

    double fraction() const { return static_cast<double>(phase) / PHASES; }

    int pixel;
    int phase;
};

bool isServed(const QPainter& painter, const QTransform& transform)
{
    return painter.testRenderHint(QPainter::Antialiasing) && transform.type() <= QTransform::TxTranslate &&
           std::abs(transform.dx()) < FARTHEST && std::abs(transform.dy()) < FARTHEST &&
           painter.paintEngine()->type() == QPaintEngine::Raster;
}

const QPainterPath& pathOf(const GlyphPath& glyph, int penWidth)
{
    return penWidth > 0 ? glyph.outline(penWidth) : glyph.fill();
}

// Returns the picture of the path with its origin at this part of a pixel; null if that is too large.
std::unique_ptr<Mask> draw(const QPainterPath& path, const QColor& color, QPointF fraction)
{
    const QRectF area = path.controlPointRect().translated(fraction).adjusted(-1, -1, 1, 1);
    if (area.width() * area.height() > LARGEST_PICTURE)
        return nullptr;
    const QRect bounds = area.toAlignedRect();
    auto mask = std::make_unique<Mask>();
    mask->image = QImage(bounds.size(), QImage::Format_ARGB32_Premultiplied);
    if (mask->image.isNull())
        return nullptr;
    mask->offset = bounds.topLeft();
    mask->image.fill(Qt::transparent);
    QPainter painter(&mask->image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(fraction - bounds.topLeft());
    painter.fillPath(path, color);
    return mask;
}

// A pen width of 0 stands for the filled shape.
void fillMasked(QPainter& painter, const GlyphPath& glyph, int penWidth, const QColor& color)
{
    static QCache<MaskKey, Mask> masks(CACHE_BYTES);
    const QTransform transform = painter.combinedTransform();
    if (!isServed(painter, transform)) {
        painter.fillPath(pathOf(glyph, penWidth), color);
        return;
    }
    const Place x(transform.dx());
    const Place y(transform.dy());
    const MaskKey key{glyph.id(), penWidth, color.rgba(), x.phase, y.phase};
    const Mask* mask = masks.object(key);
    if (!mask) {
        std::unique_ptr<Mask> made =
            draw(pathOf(glyph, penWidth), color, QPointF(x.fraction(), y.fraction()));
        if (!made) {
            painter.fillPath(pathOf(glyph, penWidth), color);
            return;
        }
        mask = made.get();
        // Smaller than the cache, so that it stays.
        masks.insert(key, made.release(), static_cast<int>(mask->image.sizeInBytes()) + int(sizeof(Mask)));
    }
    painter.drawImage(
        QPointF(x.pixel + mask->offset.x() - transform.dx(), y.pixel + mask->offset.y() - transform.dy()),
        mask->image);
}

} // namespace

void GlyphMasks::fill(QPainter& painter, const GlyphPath& glyph, const QColor& color)
{
    fillMasked(painter, glyph, 0, color);
}

void GlyphMasks::fillOutline(QPainter& painter, const GlyphPath& glyph, int penWidth, const QColor& color)
{
    fillMasked(painter, glyph, penWidth, color);
}

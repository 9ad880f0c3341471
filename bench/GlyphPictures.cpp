#include "bench/GlyphPictures.h"

#include <QPainter>
#include <cmath>

namespace
{

constexpr double SAME_PLACE = 1e-6; // pixels

bool isSame(const PathRecorder::FilledPath& one, const PathRecorder::FilledPath& other)
{
    const auto fraction = [](double value) { return value - std::floor(value); };
    return one.color == other.color &&
           std::abs(fraction(one.origin.x()) - fraction(other.origin.x())) < SAME_PLACE &&
           std::abs(fraction(one.origin.y()) - fraction(other.origin.y())) < SAME_PLACE &&
           one.path == other.path;
}

QPoint wholePixel(QPointF place)
{
    return {static_cast<int>(std::floor(place.x())), static_cast<int>(std::floor(place.y()))};
}

} // namespace

GlyphPictures::GlyphPictures(const std::vector<PathRecorder::FilledPath>& paths)
{
    std::vector<const PathRecorder::FilledPath*> drawn;
    std::vector<QPoint> corners; // of the pictures, from the whole pixel of the origin
    for (const PathRecorder::FilledPath& path : paths) {
        std::size_t known = 0;
        while (known < drawn.size() && !isSame(*drawn[known], path))
            ++known;
        const QPoint pixel = wholePixel(path.origin);
        if (known == drawn.size()) {
            const QPointF fraction = path.origin - pixel;
            const QRect area =
                path.path.controlPointRect().translated(fraction).adjusted(-1, -1, 1, 1).toAlignedRect();
            QImage picture(area.size(), QImage::Format_ARGB32_Premultiplied);
            picture.fill(Qt::transparent);
            QPainter painter(&picture);
            painter.setRenderHint(QPainter::Antialiasing);
            painter.translate(fraction - area.topLeft());
            painter.fillPath(path.path, path.color);
            painter.end();
            drawn.push_back(&path);
            corners.push_back(area.topLeft());
            m_pictures.push_back(picture);
        }
        m_placed.push_back({known, pixel + corners[known]});
    }
}

void GlyphPictures::draw(QPainter& painter, QPoint origin) const
{
    for (const Placed& placed : m_placed)
        painter.drawImage(placed.corner + origin, m_pictures[placed.picture]);
}

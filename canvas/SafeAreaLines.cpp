#include "canvas/SafeAreaLines.h"

#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QPen>

namespace
{
constexpr int PEN_WIDTH = 2;
} // namespace

SafeAreaLines::SafeAreaLines(QGraphicsScene& scene) : m_scene(scene)
{
}

void SafeAreaLines::draw(int z)
{
    if (m_lines.isEmpty()) {
        const QPen solid(Qt::black, PEN_WIDTH, Qt::SolidLine);
        const QPen dotted(Qt::white, PEN_WIDTH, Qt::DotLine);
        for (const QRectF& area : {OUTER_AREA, INNER_AREA}) {
            for (const QPen& pen : {solid, dotted}) {
                QGraphicsRectItem* line = m_scene.addRect(area, pen);
                line->setAcceptedMouseButtons(Qt::NoButton);
                m_lines.append(line);
            }
        }
    }
    setZValue(z);
}

void SafeAreaLines::remove()
{
    for (QGraphicsRectItem* line : std::as_const(m_lines)) {
        m_scene.removeItem(line);
        delete line;
    }
    m_lines.clear();
}

void SafeAreaLines::setZValue(int z)
{
    for (QGraphicsRectItem* line : std::as_const(m_lines))
        line->setZValue(z);
}

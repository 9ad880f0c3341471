#include "canvas/SafeAreaLines.h"

#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QPen>

namespace
{
constexpr QRectF OuterArea(64.0, 36.0, 1152.0, 648.0);
constexpr QRectF InnerArea(128.0, 72.0, 1024.0, 576.0);
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
        for (const QRectF& area : {OuterArea, InnerArea}) {
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

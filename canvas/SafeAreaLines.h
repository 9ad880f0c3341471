#pragma once

#include <QList>
#include <QRectF>

class QGraphicsRectItem;
class QGraphicsScene;

// The two rectangles that mark the area that every receiver shows: 90% and 80% of the 1280 by 720 canvas.
// Each is a dotted white line over a solid black one. The scene owns the items; call forget() before it is
// cleared.
class SafeAreaLines
{
public:
    // In canvas pixels.
    static constexpr QRectF OUTER_AREA{64.0, 36.0, 1152.0, 648.0};
    static constexpr QRectF INNER_AREA{128.0, 72.0, 1024.0, 576.0};

    explicit SafeAreaLines(QGraphicsScene& scene);

    void draw(int z);
    void remove();
    void forget() { m_lines.clear(); }
    void setZValue(int z);

private:
    QGraphicsScene& m_scene;
    QList<QGraphicsRectItem*> m_lines;
};

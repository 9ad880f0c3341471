#pragma once

#include <QList>

class QGraphicsRectItem;
class QGraphicsScene;

// The two rectangles that mark the area that every receiver shows: 90% and 80% of the 1280 by 720 canvas.
// Each is a dotted white line over a solid black one. The scene owns the items; call forget() before it is
// cleared.
class SafeAreaLines
{
public:
    explicit SafeAreaLines(QGraphicsScene& scene);

    void draw(int z);
    void remove();
    void forget() { m_lines.clear(); }
    void setZValue(int z);

private:
    QGraphicsScene& m_scene;
    QList<QGraphicsRectItem*> m_lines;
};

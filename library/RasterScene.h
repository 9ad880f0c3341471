#pragma once

#include <QGraphicsScene>
#include <QList>
#include <QPixmap>
#include <QSize>

class Archive;
class GraphicsPixmap;
class GraphicsText;

// A title laid out for air: a scene of 1920x1080 with the background and the text objects as they are drawn
// into the big picture. Filled, drawn and cleared for each title. GUI thread only; needs no window.
class RasterScene
{
public:
    static constexpr QSize SIZE{1920, 1080};

    RasterScene();

    // Shows the texts and the background of the title; a null picture stands for a title without one. Call
    // clear() first if another title is shown.
    void show(const Archive& archive, const QPixmap& background);
    void clear();

    // Returns the text objects in the order of the record, until the scene is cleared.
    const QList<GraphicsText*>& texts() const { return m_texts; }
    QGraphicsScene& scene() { return m_scene; }

private:
    QGraphicsScene m_scene;
    QList<GraphicsText*> m_texts; // owned by m_scene
};

// A text object of parent and child, for tests.
#pragma once

#include "CanvasTestTools.h"

#include <QGraphicsScene>

// A pair in a scene, read back while it is typed into.
struct Pair {
    explicit Pair(const TText& record)
    {
        TText copy = record;
        scene.setSceneRect(TextObjectConstants::SCENE_RECT);
        parent = new GraphicsText(true, nullptr, &scene);
        child = new GraphicsText(&copy, 0, parent, nullptr);
        parent->setPos(record.getXValue(), record.getYValue());
        connectDocument(*child);
        child->initShowText();
    }
    TText& record() { return *child->getItemTText(); }

    QGraphicsScene scene;
    GraphicsText* parent = nullptr;
    GraphicsText* child = nullptr;
};

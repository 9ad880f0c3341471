#pragma once

#include "CanvasTestTools.h"

#include <QGraphicsScene>

// A text object of parent and child in a scene, for tests. Typed text is read back into the record.
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

#pragma once

#include "bench/ShownList.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "canvas/IThumbnailRender.h"

#include <QSize>
#include <QUndoStack>
#include <memory>

// List and canvas connected as in the window, without the sibling processes.
class TitleEditor
{
public:
    static const QSize CANVAS;

    // Opens the folder. Without a picture maker no pictures are made.
    TitleEditor(const QString& folder, std::unique_ptr<IThumbnailRender> render);

    // Shows the list, then the canvas.
    void show();

    CanvasScene scene;
    GraphicsView view;
    ShownList shown;
    QUndoStack undo;
};

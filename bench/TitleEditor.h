// List and canvas wired as in the window, without the processes around it.
#pragma once

#include "bench/ShownList.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "canvas/IThumbnailRender.h"

#include <QSize>
#include <QUndoStack>
#include <memory>

class TitleEditor
{
public:
    static const QSize CANVAS;

    // Opens the folder. Without a render no pictures are made.
    TitleEditor(const QString& folder, std::unique_ptr<IThumbnailRender> render);

    // Shows the list, then the canvas.
    void show();

    CanvasScene scene;
    GraphicsView view;
    ShownList shown;
    QUndoStack undo;
};

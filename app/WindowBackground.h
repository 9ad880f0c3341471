#pragma once

#include "canvas/DrawBoundingRectangle.h"

#include <QImage>
#include <QPixmap>
#include <QPoint>

#include <vector>

class QPainter;

// Paints the window behind its widgets: two frames, the surround of the canvas and the separators. Window
// coordinates. GUI thread.
class WindowBackground
{
public:
    // Loads the pictures at the first call.
    void paint(QPainter& painter);

private:
    struct Strip {
        QPoint place; // in the picture
        QPixmap picture;
    };

    void load();

    // Painted from their pieces: a pixmap as large as the window is mostly its even middle.
    DrawBoundingRectangle m_windowFrame;
    DrawBoundingRectangle m_leftFrame;
    std::vector<Strip> m_canvasSurround; // without what the canvas covers
    QImage m_vertical;                   // separators
    QImage m_horizontal;
};

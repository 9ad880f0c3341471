#pragma once

#include "canvas/DrawBoundingRectangle.h"

#include <QImage>
#include <QPixmap>

class QPainter;

// Paints the window behind its widgets: two frames, the surround of the canvas and the separators. Window
// coordinates. GUI thread.
class WindowBackground
{
public:
    // Loads the pictures at the first call.
    void paint(QPainter& painter);

private:
    void load();

    // Painted from their pieces: a pixmap as large as the window is mostly its even middle.
    DrawBoundingRectangle m_windowFrame;
    DrawBoundingRectangle m_leftFrame;
    QPixmap m_canvasSurround;
    QImage m_vertical; // separators
    QImage m_horizontal;
};

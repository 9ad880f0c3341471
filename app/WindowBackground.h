#pragma once

#include <QImage>
#include <QPixmap>

class QPainter;

// What the window paints behind its widgets: two frames, the surround of the canvas and the separators.
// Coordinates are the window's. GUI thread.
class WindowBackground
{
public:
    // Makes the frames anew, for a window that has changed its size.
    void makeFrames();
    // Pictures are loaded at the first call.
    void paint(QPainter& painter);

private:
    void load();

    QPixmap m_windowFrame;
    QPixmap m_leftFrame;
    QPixmap m_canvasSurround;
    QImage m_vertical; // separators
    QImage m_horizontal;
};

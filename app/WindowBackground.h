#pragma once

#include <QImage>
#include <QPixmap>

class QPainter;

// Paints the window behind its widgets: two frames, the surround of the canvas and the separators. Window
// coordinates. GUI thread.
class WindowBackground
{
public:
    // Makes the frames again. Call when the size of the window has changed.
    void makeFrames();
    // Loads the pictures at the first call.
    void paint(QPainter& painter);

private:
    void load();

    QPixmap m_windowFrame;
    QPixmap m_leftFrame;
    QPixmap m_canvasSurround;
    QImage m_vertical; // separators
    QImage m_horizontal;
};

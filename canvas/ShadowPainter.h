#pragma once

#include <QColor>
#include <QImage>
#include <QPixmap>
#include <QPoint>
#include <QPointF>

class QPainter;

// Draws pictures with a shadow: the pixels that QGraphicsDropShadowEffect draws, in a fraction of its memory
// and time. The shadow is blurred as a mask of half the size and drawn a few lines at a time. GUI thread
// only.
class ShadowPainter
{
public:
    ShadowPainter(QPointF offset, double blurRadius, const QColor& color);

    // Returns whether draw() can be used: with small blurs, and offsets between pixels, it cannot.
    bool isServed() const;
    // Draws the shadow and the picture. place is its corner in device pixels; the painter has no world
    // transform. The picture has an alpha channel, and a width and height of at least 2.
    void draw(QPainter& painter, QPoint place, const QPixmap& picture) const;

private:
    QImage blurredMask(const QImage& picture) const;

    QPointF m_offset;
    double m_blurRadius;
    QColor m_color;
};

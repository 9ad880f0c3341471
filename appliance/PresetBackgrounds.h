#pragma once

#include <QImage>
#include <QSize>

// Paints the backgrounds of the preset templates. Each is painted for the requested raster of 16 by 9 and is
// transparent outside its shapes. The result is always the same.
class PresetBackgrounds
{
public:
    // A plate in the lower third that fades out to the right, with an accent before the text.
    static QImage lowerThird(const QSize& raster);
    // A bar across the whole width with a tag at its left end.
    static QImage strap(const QSize& raster);
    // Covers the whole picture, but is slightly transparent.
    static QImage fullScreen(const QSize& raster);
    // A panel in the middle with a large quotation mark.
    static QImage quote(const QSize& raster);
    // Two plates, the upper light and the lower dark.
    static QImage namePlate(const QSize& raster);
    // A small mark in the upper right corner.
    static QImage cornerMark(const QSize& raster);
    // A panel along the right side with three bullets.
    static QImage sidePanel(const QSize& raster);
};

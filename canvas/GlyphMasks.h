#pragma once

#include <QColor>

class GlyphPath;
class QPainter;

// Fills the shapes of glyphs from pictures that are drawn once for each shape, colour and place within a
// pixel: drawing a picture takes a small part of the time of filling the path. Pixels at an edge may differ
// from those of the path by a rounding.
//
// The pictures used last are kept, up to 16 MB in this process. The path itself is filled where a picture
// does not serve: with a painter that is not antialiased, that scales or turns or does not draw pixels, and
// for very large shapes. GUI thread only.
class GlyphMasks
{
public:
    // The baseline of the glyph begins at the painter's origin.
    static void fill(QPainter& painter, const GlyphPath& glyph, const QColor& color);
    // Fills the area of a pen of this width, at least 1, along the contour.
    static void fillOutline(QPainter& painter, const GlyphPath& glyph, int penWidth, const QColor& color);
};

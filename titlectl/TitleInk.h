#pragma once

#include "library/RasterScene.h"

#include <QRect>
#include <QRectF>
#include <vector>

class Archive;

// What the texts of a title draw, in pixels of the 1920x1080 raster: where, and whether it stands out from
// what is around it. GUI thread only.
class TitleInk
{
public:
    // How far outside the raster is looked for ink.
    static constexpr int BORDER = 64;
    // How much a channel of some pixel differs at least (0 to 255) where a text stands out.
    static constexpr int LEAST_CONTRAST = 24;

    struct Text {
        // Where glyphs and outlines are, without the shadow; within the raster and BORDER around it. Empty if
        // nothing is drawn there.
        QRect ink;
        QRectF layout;    // where the layout puts the characters, at any distance
        int contrast = 0; // the largest difference that the text makes to the picture
    };

    explicit TitleInk(const Archive& archive);

    // Returns one entry for each text object, in the order of the record.
    const std::vector<Text>& texts() const { return m_texts; }

    // Returns the rectangle of all pixels that are not transparent, but for faint ones.
    static QRect inkIn(const QImage& image);
    // Returns the largest difference of a channel between two pictures of the same size, both of 32 bits.
    static int largestDifference(const QImage& a, const QImage& b);

private:
    Text measure(qsizetype index);
    QImage draw(const QRect& area);

    RasterScene m_raster;
    std::vector<Text> m_texts;
};

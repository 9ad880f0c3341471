#pragma once

#include "bench/PathRecorder.h"

#include <QImage>
#include <QPoint>
#include <cstddef>
#include <vector>

class QPainter;

// Filled paths as ready pictures: the least that drawing known shapes can cost. Equal paths at the same place
// within a pixel share a picture.
class GlyphPictures
{
public:
    explicit GlyphPictures(const std::vector<PathRecorder::FilledPath>& paths);

    // Draws the pictures in the order of the paths, with the device's origin moved to this place.
    void draw(QPainter& painter, QPoint origin = {}) const;

private:
    struct Placed {
        std::size_t picture;
        QPoint corner; // in device pixels
    };

    std::vector<QImage> m_pictures;
    std::vector<Placed> m_placed;
};

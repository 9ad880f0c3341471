#pragma once

#include <QImage>

// Reduces pictures to half their width and height.
class HalfPicture
{
public:
    // Sets each pixel of half to the mean of four pixels of the picture, channel by channel, rounded down:
    // the pixels that QImage::scaled gives with Qt::SmoothTransformation. Both have 32 bits a pixel in the
    // same format, and the picture has twice the width and height of half. Any thread.
    static void reduce(const QImage& picture, QImage& half);
};

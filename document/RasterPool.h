#pragma once

#include <QImage>
#include <QSize>

// Memory of large pictures, which is kept for the next ones: the system clears new memory page by page when
// it is first written, which takes longer than drawing a short text. Any thread.
class RasterPool
{
public:
    // Bytes that are kept at most: those of one 1920x1080 picture and the smaller ones made from it.
    static constexpr qsizetype LIMIT = 12 * 1024 * 1024;

    // Returns a picture in the format ARGB32_Premultiplied whose pixels are not set; null if memory is
    // lacking. The pool takes its memory back from the last copy.
    static QImage take(QSize size);
    // Frees what is kept.
    static void clear();
    // Returns the number of bytes that are kept.
    static qsizetype keptBytes();
};

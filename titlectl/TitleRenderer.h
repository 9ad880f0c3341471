#pragma once

#include "library/ThumbnailRender.h"
#include "titlectl/RenderJob.h"

#include <QString>

class Archive;

// Makes the pictures of titles, one after another, as the titler does. GUI thread only.
class TitleRenderer
{
public:
    // Reads the title and makes its pictures. Returns what went wrong, or an empty string.
    QString render(const RenderJob& job);

    // Draws the pictures of the record, and writes them with write().
    QList<QImage> draw(const Archive& archive) { return m_render.drawPictures(archive); }
    // Writes pictures that draw() returned. Returns what went wrong, or an empty string.
    static QString write(const Archive& archive, const QList<QImage>& images,
                         PictureFiles::Pictures pictures);

private:
    ThumbnailRender m_render;
};

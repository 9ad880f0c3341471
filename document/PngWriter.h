// Writes pictures as files that are never seen half-written. PNG files are made by an encoder of this
// program: at its compression level it takes a fraction of the time of QImage::save for the same pixels.
#pragma once

#include "support/AtomicFile.h"

#include <QByteArray>
#include <QImage>
#include <QString>
#include <string>

class PngWriter
{
public:
    // Saves as QImage::save does, the format being that of the extension: what is read back has the same
    // pixels, format and resolution. False, with the old file untouched, when the picture is null, the
    // extension is that of no format, or the disk refuses. Any thread.
    static bool save(const QImage& image, const QString& path,
                     AtomicFile::Durability durability = AtomicFile::Durability::Automatic);

    // As save, without waiting for the disk to sync. A picture that the disk refuses is kept for its title,
    // and written when the disk takes it (RefusedWrites).
    static bool saveOrKeep(const QImage& image, const QString& path, const std::string& title);

    // The bytes of a PNG file; empty for a null picture.
    static QByteArray encode(const QImage& image);

private:
    static QByteArray encodeFor(const QImage& image, const QString& path);
};

#pragma once

#include "support/AtomicFile.h"

#include <QByteArray>
#include <QImage>
#include <QString>
#include <string>

// Saves pictures as files that are never visible half-written. Most PNG files are made by PngEncoder, in a
// fraction of the time of QImage::save.
class PngWriter
{
public:
    // Saves as QImage::save does, in the format of the extension: the saved picture has the same pixels,
    // format and resolution. Returns false, with the old file unchanged, if the picture is null, the
    // extension is unknown, or writing fails. Any thread.
    static bool save(const QImage& image, const QString& path,
                     AtomicFile::Durability durability = AtomicFile::Durability::Automatic);

    // As save, but does not wait for a sync. A picture that cannot be written is kept for its title and
    // written later (RefusedWrites).
    static bool saveOrKeep(const QImage& image, const QString& path, const std::string& title);

    // Returns the bytes of a PNG file; empty for a null picture.
    static QByteArray encode(const QImage& image);

private:
    static QByteArray encodeFor(const QImage& image, const QString& path);
};

// Decodes picture files that other programs may have made: the only way in which a picture file from the disk
// becomes an image here. Any thread; made on the stack for one file.
#pragma once

#include <QByteArray>
#include <QImage>
#include <QSize>
#include <QString>
#include <string>

class PictureReader
{
public:
    // No picture within the limits of PictureGuard is larger, stored in full.
    static constexpr qint64 MAX_FILE_BYTES = qint64(257) * 1024 * 1024;

    // Reads the file into memory and has it checked. What is no plain file, too large, or refused has no
    // size, and reads as null.
    explicit PictureReader(const QString& path);

    // In pixels, as stored.
    QSize size() const { return mSize; }

    // Decodes the picture, at another size where one is given, which for some formats is quicker than to
    // scale it later. Null when the decoder fails.
    QImage read(const QSize& scaledSize = QSize()) const;

    // The same in one step.
    static QImage read(const QString& path);

private:
    QByteArray bytes() const; // not to be kept longer than this

    std::string mBytes;
    QByteArray mFormat;
    QSize mSize;
};

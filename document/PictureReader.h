#pragma once

#include <QByteArray>
#include <QImage>
#include <QSize>
#include <QString>
#include <string>

// Decodes picture files from untrusted sources. All picture files on the disk are read through this class.
// Any thread; made on the stack for one file.
class PictureReader
{
public:
    // Limit of the file size in bytes; any picture within the limits of PictureGuard fits, even uncompressed.
    static constexpr qint64 MAX_FILE_BYTES = qint64(257) * 1024 * 1024;

    // Reads the file into memory and checks it. If it is not a regular file, too large, or refused, size() is
    // empty and read() returns null.
    explicit PictureReader(const QString& path);

    // Returns the stored size in pixels.
    QSize size() const { return m_size; }

    // Decodes the picture and scales it to scaledSize if that is valid, which for some formats is faster than
    // scaling it later. Returns null if the decoder fails.
    QImage read(const QSize& scaledSize = QSize()) const;

    // Reads, checks and decodes a file in one step.
    static QImage read(const QString& path);

private:
    QByteArray bytes() const; // shares the memory of m_bytes; valid during the lifetime of this object

    std::string m_bytes;
    QByteArray m_format;
    QSize m_size;
};

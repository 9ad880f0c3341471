// Checks the bytes of a picture file before a decoder sees them.
//
// Decoders make room for what a header claims: a file of a few hundred bytes can take gigabytes, or minutes.
// What a picture would take is therefore worked out from its headers here, and one that claims more than the
// limits, or parts that are not in the file, is refused. A refused picture is an unreadable one. Any thread.
#pragma once

#include <QByteArray>
#include <QSize>

class PictureGuard
{
public:
    static constexpr int MAX_SIDE = 8192; // pixels
    static constexpr qint64 MAX_DECODED_BYTES = qint64(256) * 1024 * 1024;

    // Looks through the headers of a whole file. Formats other than PNG, BMP, JPEG, GIF and TIFF are refused.
    explicit PictureGuard(const QByteArray& bytes);

    bool isAccepted() const { return !mFormat.isEmpty(); }

    // Qt's name of the format; empty when refused. No other decoder may see the bytes.
    QByteArray format() const { return mFormat; }

    // In pixels, as stored; empty when refused.
    QSize size() const { return isAccepted() ? mSize : QSize(); }

    // Whether bytes begin as those of one of the five formats do.
    static bool isKnown(const QByteArray& bytes);

private:
    QByteArray mFormat;
    QSize mSize;
};

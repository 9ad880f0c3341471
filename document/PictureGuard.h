#pragma once

#include <QByteArray>
#include <QSize>

// Checks the bytes of a picture file before they are decoded.
//
// Decoders allocate what a header claims: a file of a few hundred bytes can need gigabytes of memory or
// minutes of time. This class calculates the need from the headers and refuses a picture that exceeds the
// limits or claims parts that are not in the file. A refused picture is treated as unreadable. Any thread.
class PictureGuard
{
public:
    static constexpr int MAX_SIDE = 8192; // in pixels
    static constexpr qint64 MAX_DECODED_BYTES = qint64(256) * 1024 * 1024;

    // Checks the headers of a whole file. Refuses formats other than PNG, BMP, JPEG, GIF and TIFF.
    explicit PictureGuard(const QByteArray& bytes);

    bool isAccepted() const { return !m_format.isEmpty(); }

    // Returns Qt's name of the format; empty if refused. Only this decoder may read the bytes.
    QByteArray format() const { return m_format; }

    // Returns the stored size in pixels; empty if refused.
    QSize size() const { return isAccepted() ? m_size : QSize(); }

private:
    QByteArray m_format;
    QSize m_size;
};

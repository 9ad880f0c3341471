#pragma once

#include <QByteArray>
#include <QImage>

struct libdeflate_compressor;

// Writes a lossless PNG file with the least effort: a line filter only where it saves time, and the fastest
// level of the fastest deflate library available.
class FastPng
{
public:
    FastPng();
    ~FastPng();
    FastPng(const FastPng&) = delete;
    FastPng& operator=(const FastPng&) = delete;

    // Stores lines unchanged, or as differences to the line above, which is smaller and faster for pictures
    // with large areas of one colour.
    enum class Filter { None, Up };

    QByteArray encode(const QImage& image, Filter filter);

private:
    libdeflate_compressor* m_compressor;
    QByteArray m_lines;
    QByteArray m_packed;
};

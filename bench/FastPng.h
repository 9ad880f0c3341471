#pragma once

#include <QByteArray>
#include <QImage>
#include <memory>

struct libdeflate_compressor;

// Writes a lossless PNG file with the least effort: a line filter only where it saves time, and a low level
// of the fastest deflate library available.
class FastPng
{
public:
    // Stores lines unchanged, or as differences to the line above, which is smaller and faster for pictures
    // with large areas of one colour.
    enum class Filter { None, Up };

    FastPng(Filter filter, int level);
    ~FastPng();
    FastPng(const FastPng&) = delete;
    FastPng& operator=(const FastPng&) = delete;

    // Returns an encoder with the filter and the level, 1 or 2, that are fastest for the picture.
    static std::unique_ptr<FastPng> fastestFor(const QImage& image);

    QByteArray encode(const QImage& image);

private:
    Filter m_filter;
    libdeflate_compressor* m_compressor;
    QByteArray m_lines;
    QByteArray m_packed;
};

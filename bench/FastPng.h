// The least that a lossless PNG file of a picture can cost: no line filter that pays nothing, the fastest
// level of the fastest deflate at hand.
#pragma once

#include <QByteArray>
#include <QImage>

struct libdeflate_compressor;

class FastPng
{
public:
    FastPng();
    ~FastPng();
    FastPng(const FastPng&) = delete;
    FastPng& operator=(const FastPng&) = delete;

    // Lines as they are, or as differences to the line above, which is smaller and faster where areas of one
    // colour prevail.
    enum class Filter { None, Up };

    QByteArray encode(const QImage& image, Filter filter);

private:
    libdeflate_compressor* mCompressor;
    QByteArray mLines;
    QByteArray mPacked;
};

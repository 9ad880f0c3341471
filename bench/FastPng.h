#pragma once

#include <QByteArray>
#include <QImage>
#include <cstddef>
#include <memory>
#include <vector>

struct libdeflate_compressor;

// Encodes one picture again and again as a lossless PNG file with the least effort: a line filter only where
// it saves time, a low level of the fastest deflate library available, and strips of the picture side by
// side.
class FastPng
{
public:
    // Stores lines unchanged, or as differences to the line above, which is smaller and faster for pictures
    // with large areas of one colour.
    enum class Filter { None, Up };

    // Strips is the number of threads, at least 1 and at most the height of the picture. The constructor
    // encodes the picture once to learn where the compressed strips are to be joined: the library is
    // deterministic, so that encode() finds the same places again.
    FastPng(const QImage& image, Filter filter, int level, int strips);
    ~FastPng();
    FastPng(const FastPng&) = delete;
    FastPng& operator=(const FastPng&) = delete;

    // Returns an encoder with the filter, the level from 1 to 3 and the number of strips that are fastest for
    // the picture. A thread each is allowed to this number of strips.
    static std::unique_ptr<FastPng> fastestFor(const QImage& image, int strips);

    QByteArray encode();
    const QImage& image() const { return m_image; }

private:
    struct Strip;

    void compressAll();
    void compress(Strip& strip) const;

    QImage m_image;
    Filter m_filter;
    std::vector<std::unique_ptr<Strip>> m_strips;
};

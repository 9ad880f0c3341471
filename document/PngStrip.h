#pragma once

#include "document/DeflateWriter.h"

#include <QByteArray>
#include <QImage>
#include <cstdint>
#include <vector>

// Compresses strips of a picture as the lines of a PNG file. Made for titles: pixels that are equal to those
// above them are not converted, and what repeats is looked for in the pixel before only. Keeps its buffers,
// 256 kB and four lines, for the next strip. One thread at a time.
class PngStrip
{
public:
    // The lines of a strip as a part of the file's stream.
    struct Part {
        QByteArray bytes;
        std::uint64_t size = 0;  // of the lines before they were compressed
        std::uint32_t adler = 1; // check sum of them
    };

    // Qt converts premultiplied pixels in groups, and rounds what is left of a line in another way.
    static constexpr int WIDTH_STEP = 16;

    // Compresses the lines from top up to, but not including, bottom. The format is RGB32 (without alpha in
    // the file), ARGB32, or ARGB32_Premultiplied with a width that is a multiple of WIDTH_STEP.
    Part compress(const QImage& image, int top, int bottom, DeflateWriter::Ending ending);

    // Returns the check sum of everything up to the part and of the part. That of nothing is 1.
    static std::uint32_t joinedSum(std::uint32_t before, const Part& part);

private:
    void start(const QImage& image, int top);
    void convert(const QRgb* pixels, std::uint32_t* converted, int count) const;
    void addLine(const QRgb* pixels, const QRgb* above);
    void addPixels(int begin, int end);
    void addZeros(int count);
    void addRun(int size, int distance);
    void addToSum(int begin, int end);

    DeflateWriter m_writer;
    QImage::Format m_format = QImage::Format_Invalid;
    int m_pixelSize = 4; // bytes in the file
    int m_width = 0;
    std::uint32_t m_adler = 1;
    // Pixels in the order of the file's bytes.
    std::vector<std::uint32_t> m_above;       // the line before this one
    std::vector<std::uint32_t> m_converted;   // those of this line that differ from it
    std::vector<std::uint32_t> m_differences; // of this line from the one before
    std::vector<char> m_packed;               // the same as bytes, for three bytes a pixel
};

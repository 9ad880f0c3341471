#include "document/PngStrip.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstddef>
#include <cstring>
#include <libdeflate.h>

namespace
{

constexpr unsigned char FILTER_UP = 2;
constexpr std::uint64_t ADLER_MODULUS = 65521;
constexpr int OPAQUE = 255;

// Colours by alpha and premultiplied colour, as Qt converts them.
using Unmultiplied = std::array<std::array<std::uint8_t, 256>, 256>;

const Unmultiplied& unmultiplied()
{
    static const Unmultiplied table = [] {
        QImage all(256, 256, QImage::Format_ARGB32_Premultiplied);
        for (int alpha = 0; alpha < 256; ++alpha) {
            auto* line = reinterpret_cast<QRgb*>(all.scanLine(alpha));
            for (int color = 0; color < 256; ++color)
                line[color] = qRgba(color, color, color, alpha);
        }
        all.convertTo(QImage::Format_ARGB32);
        Unmultiplied colors;
        for (int alpha = 0; alpha < 256; ++alpha) {
            const auto* line = reinterpret_cast<const QRgb*>(all.constScanLine(alpha));
            std::transform(line, line + 256, colors[static_cast<std::size_t>(alpha)].begin(),
                           [](QRgb pixel) { return static_cast<std::uint8_t>(pixel); });
        }
        return colors;
    }();
    return table;
}

static_assert(std::endian::native == std::endian::little, "the first byte of a pixel is its lowest");

// Returns the pixel with its bytes in the order of the file.
constexpr std::uint32_t inFileOrder(QRgb pixel)
{
    return (pixel & 0xff00ff00) | (pixel >> 16 & 0xff) | (pixel & 0xff) << 16;
}

// Subtracts each byte, without a byte borrowing from the next.
constexpr std::uint32_t difference(std::uint32_t pixel, std::uint32_t above)
{
    constexpr std::uint32_t TOP_BITS = 0x80808080;
    return ((pixel | TOP_BITS) - (above & ~TOP_BITS)) ^ ((pixel ^ ~above) & TOP_BITS);
}

// Number of pixels that are compared at once.
constexpr int GROUP = 64;

bool isEqual(const QRgb* a, const QRgb* b, int count)
{
    return std::memcmp(a, b, sizeof(QRgb) * static_cast<std::size_t>(count)) == 0;
}

// Returns the first pixel that differs, or width.
int differenceBegin(const QRgb* a, const QRgb* b, int width)
{
    int x = 0;
    while (x + GROUP <= width && isEqual(a + x, b + x, GROUP))
        x += GROUP;
    while (x < width && a[x] == b[x])
        ++x;
    return x;
}

// Returns the end of the last pixel that differs. One does.
int differenceEnd(const QRgb* a, const QRgb* b, int width)
{
    int x = width;
    while (x >= GROUP && isEqual(a + x - GROUP, b + x - GROUP, GROUP))
        x -= GROUP;
    while (a[x - 1] == b[x - 1])
        --x;
    return x;
}

} // namespace

PngStrip::Part PngStrip::compress(const QImage& image, int top, int bottom, DeflateWriter::Ending ending)
{
    start(image, top);
    const auto line = [&](int y) { return reinterpret_cast<const QRgb*>(image.constScanLine(y)); };
    const std::vector<QRgb> blank(top == 0 ? m_above.size() : 0);
    for (int y = top; y < bottom; ++y)
        addLine(line(y), y > 0 ? line(y - 1) : blank.data());
    const auto lineSize = static_cast<std::uint64_t>(m_width) * static_cast<std::uint64_t>(m_pixelSize) + 1;
    return {m_writer.finish(ending), lineSize * static_cast<std::uint64_t>(bottom - top), m_adler};
}

std::uint32_t PngStrip::joinedSum(std::uint32_t before, const Part& part)
{
    const std::uint64_t low = before & 0xffff;
    const std::uint64_t newLow = low + (part.adler & 0xffff) + ADLER_MODULUS - 1;
    // The part was summed up from 1 on instead of low.
    const std::uint64_t newHigh =
        (before >> 16) + (part.adler >> 16) + part.size % ADLER_MODULUS * (low + ADLER_MODULUS - 1);
    return static_cast<std::uint32_t>(newHigh % ADLER_MODULUS << 16 | newLow % ADLER_MODULUS);
}

void PngStrip::start(const QImage& image, int top)
{
    m_format = image.format();
    m_pixelSize = m_format == QImage::Format_RGB32 ? 3 : 4;
    m_width = image.width();
    m_adler = 1;
    m_above.assign(static_cast<std::size_t>(m_width), 0);
    m_converted.resize(m_above.size());
    m_differences.resize(m_above.size());
    if (top > 0)
        convert(reinterpret_cast<const QRgb*>(image.constScanLine(top - 1)), m_above.data(), m_width);
}

void PngStrip::convert(const QRgb* pixels, std::uint32_t* converted, int count) const
{
    switch (m_format) {
    case QImage::Format_RGB32:
        std::transform(pixels, pixels + count, converted,
                       [](QRgb pixel) { return inFileOrder(pixel) & 0xffffff; });
        break;
    case QImage::Format_ARGB32:
        std::transform(pixels, pixels + count, converted, inFileOrder);
        break;
    default:
        std::transform(pixels, pixels + count, converted, [&colors = unmultiplied()](QRgb pixel) {
            const int alpha = qAlpha(pixel);
            if (alpha == OPAQUE)
                return inFileOrder(pixel);
            const auto& of = colors[static_cast<std::size_t>(alpha)];
            return static_cast<std::uint32_t>(of[pixel >> 16 & 0xff] | of[pixel >> 8 & 0xff] << 8 |
                                              of[pixel & 0xff] << 16) |
                   (pixel & 0xff000000);
        });
    }
}

// Adds a line as its differences from the one above.
void PngStrip::addLine(const QRgb* pixels, const QRgb* above)
{
    const int begin = differenceBegin(pixels, above, m_width);
    const int end = begin == m_width ? m_width : differenceEnd(pixels, above, m_width);
    convert(pixels + begin, m_converted.data() + begin, end - begin);
    const auto first = m_converted.begin() + begin;
    const auto last = m_converted.begin() + end;
    std::transform(first, last, m_above.begin() + begin, m_differences.begin() + begin, difference);
    std::copy(first, last, m_above.begin() + begin);

    m_writer.addBytes(FILTER_UP, 1);
    addZeros(begin);
    addPixels(begin, end);
    addZeros(m_width - end);
    addToSum(begin, end);
}

void PngStrip::addPixels(int begin, int end)
{
    const std::uint32_t* pixels = m_differences.data();
    for (int x = begin; x < end;) {
        const std::uint32_t pixel = pixels[x];
        m_writer.addBytes(pixel, m_pixelSize);
        const int first = ++x;
        while (x < end && pixels[x] == pixel)
            ++x;
        addRun((x - first) * m_pixelSize, pixel == 0 ? 1 : m_pixelSize);
    }
}

void PngStrip::addZeros(int count)
{
    if (count > 1) {
        m_writer.addBytes(0, 1);
        addRun(count * m_pixelSize - 1, 1);
    } else if (count == 1) {
        m_writer.addBytes(0, m_pixelSize);
    }
}

// Adds size bytes, 0 or at least MIN_MATCH, that are equal to those that begin distance bytes earlier.
void PngStrip::addRun(int size, int distance)
{
    using Writer = DeflateWriter;
    while (size > 0) {
        const bool leavesTooFew = size > Writer::MAX_MATCH && size < Writer::MAX_MATCH + Writer::MIN_MATCH;
        const int length = leavesTooFew ? size - Writer::MIN_MATCH : std::min(size, Writer::MAX_MATCH);
        m_writer.addMatch(length, distance);
        size -= length;
    }
}

// Adds the line to the check sum. Pixels before begin and from end on are zero.
void PngStrip::addToSum(int begin, int end)
{
    const auto size = [&](int count) {
        return static_cast<std::size_t>(count) * static_cast<std::size_t>(m_pixelSize);
    };
    const auto addZeroBytes = [&](std::uint64_t count) {
        const std::uint64_t low = m_adler & 0xffff;
        const std::uint64_t high = ((m_adler >> 16) + count * low) % ADLER_MODULUS;
        m_adler = static_cast<std::uint32_t>(high << 16 | low);
    };
    const void* bytes = m_differences.data() + begin;
    if (m_pixelSize == 3) {
        m_packed.resize(size(end - begin));
        for (int x = begin; x < end; ++x)
            std::memcpy(m_packed.data() + size(x - begin), m_differences.data() + x, 3);
        bytes = m_packed.data();
    }
    m_adler = libdeflate_adler32(m_adler, &FILTER_UP, 1);
    addZeroBytes(size(begin));
    if (begin < end)
        m_adler = libdeflate_adler32(m_adler, bytes, size(end - begin));
    addZeroBytes(size(m_width - end));
}

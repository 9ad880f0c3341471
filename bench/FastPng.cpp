#include "bench/FastPng.h"

#include <QElapsedTimer>
#include <QtEndian>
#include <algorithm>
#include <cstring>
#include <future>
#include <libdeflate.h>
#include <limits>
#include <utility>
#include <zlib.h>

namespace
{

constexpr int TRIES = 3;

void addNumber(QByteArray& bytes, quint32 number)
{
    char big[4];
    qToBigEndian(number, big);
    bytes.append(big, sizeof big);
}

void addChunk(QByteArray& bytes, const char* type, const QByteArray& data)
{
    addNumber(bytes, static_cast<quint32>(data.size()));
    const qsizetype start = bytes.size();
    bytes.append(type, 4).append(data);
    addNumber(bytes,
              libdeflate_crc32(0, bytes.constData() + start, static_cast<std::size_t>(data.size()) + 4));
}

// Places in a compressed strip, in bits from its beginning.
struct Ends {
    std::size_t lastBlock = 0; // where the last block begins
    std::size_t end = 0;
};

// Finds the places by decompressing, since the library does not report them.
Ends findEnds(const QByteArray& packed, std::size_t size)
{
    Ends ends;
    QByteArray lines(static_cast<qsizetype>(size) + 1, Qt::Uninitialized);
    z_stream stream{};
    if (inflateInit2(&stream, -MAX_WBITS) != Z_OK)
        return ends;
    stream.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(packed.constData()));
    stream.avail_in = static_cast<uInt>(packed.size());
    stream.next_out = reinterpret_cast<Bytef*>(lines.data());
    stream.avail_out = static_cast<uInt>(lines.size());
    constexpr int UNUSED_BITS = 7;
    constexpr int LAST_BLOCK = 64;
    while (inflate(&stream, Z_BLOCK) == Z_OK) {
        ends.lastBlock = std::exchange(ends.end, stream.total_in * 8 - (stream.data_type & UNUSED_BITS));
        if (stream.data_type & LAST_BLOCK)
            break;
    }
    inflateEnd(&stream);
    return ends;
}

// Makes the compressed strip one that another may follow: its last block is no longer marked as the last, and
// an empty stored block fills it up to a whole byte. The bits behind its end are 0, as those of that block's
// head.
void openEnd(QByteArray& packed, const Ends& ends)
{
    constexpr std::size_t BLOCK_HEAD = 3;
    char& byte = packed.data()[ends.lastBlock / 8];
    byte = static_cast<char>(byte & ~(1 << ends.lastBlock % 8));
    const std::size_t rest = static_cast<std::size_t>(packed.size()) * 8 - ends.end;
    if (rest < BLOCK_HEAD)
        packed.append('\0');
    packed.append("\x00\x00\xff\xff", 4);
}

} // namespace

struct FastPng::Strip {
    Strip(int firstLine, int endLine, int level)
        : top(firstLine), bottom(endLine), compressor(libdeflate_alloc_compressor(level))
    {
    }
    ~Strip() { libdeflate_free_compressor(compressor); }
    Strip(const Strip&) = delete;
    Strip& operator=(const Strip&) = delete;

    int top;
    int bottom; // the line behind the last
    libdeflate_compressor* compressor;
    QByteArray lines; // filtered
    QByteArray packed;
    quint32 checksum = 1;
    Ends ends;
};

FastPng::FastPng(const QImage& image, Filter filter, int level, int strips) : m_image(image), m_filter(filter)
{
    for (int i = 0; i < strips; ++i)
        m_strips.push_back(
            std::make_unique<Strip>(image.height() * i / strips, image.height() * (i + 1) / strips, level));
    compressAll();
    for (const std::unique_ptr<Strip>& strip : m_strips)
        strip->ends = findEnds(strip->packed, static_cast<std::size_t>(strip->lines.size()));
}

FastPng::~FastPng() = default;

std::unique_ptr<FastPng> FastPng::fastestFor(const QImage& image, int strips)
{
    std::unique_ptr<FastPng> fastest;
    qint64 least = std::numeric_limits<qint64>::max();
    for (const Filter filter : {Filter::None, Filter::Up}) {
        for (const int level : {1, 2, 3}) {
            auto png = std::make_unique<FastPng>(image, filter, level, strips);
            qint64 time = std::numeric_limits<qint64>::max();
            for (int i = 0; i < TRIES; ++i) {
                QElapsedTimer timer;
                timer.start();
                png->encode();
                time = qMin(time, timer.nsecsElapsed());
            }
            if (time < least) {
                least = time;
                fastest = std::move(png);
            }
        }
    }
    return fastest;
}

void FastPng::compressAll()
{
    std::vector<std::future<void>> others; // waited for at the end
    for (std::size_t i = 1; i < m_strips.size(); ++i)
        others.push_back(std::async(std::launch::async, [this, i] { compress(*m_strips[i]); }));
    compress(*m_strips.front());
}

void FastPng::compress(Strip& strip) const
{
    const bool alpha = m_image.hasAlphaChannel();
    const int above = m_filter == Filter::Up && strip.top > 0 ? 1 : 0;
    const QImage part(m_image.constScanLine(strip.top - above), m_image.width(),
                      strip.bottom - strip.top + above, m_image.bytesPerLine(), m_image.format());
    const QImage bytesOrdered = part.convertToFormat(alpha ? QImage::Format_RGBA8888 : QImage::Format_RGB888);
    const auto lineSize = static_cast<std::size_t>(m_image.width()) * (alpha ? 4 : 3);
    strip.lines.resize(
        static_cast<qsizetype>((lineSize + 1) * static_cast<std::size_t>(part.height() - above)));
    auto* out = reinterpret_cast<uchar*>(strip.lines.data());
    for (int y = above; y < part.height(); ++y) {
        const uchar* line = bytesOrdered.constScanLine(y);
        const bool up = m_filter == Filter::Up && y > 0;
        *out++ = up ? 2 : 0;
        if (up) {
            const uchar* before = bytesOrdered.constScanLine(y - 1);
            for (std::size_t i = 0; i < lineSize; ++i)
                out[i] = static_cast<uchar>(line[i] - before[i]);
        } else {
            std::memcpy(out, line, lineSize);
        }
        out += lineSize;
    }
    const auto size = static_cast<std::size_t>(strip.lines.size());
    strip.packed.resize(static_cast<qsizetype>(libdeflate_deflate_compress_bound(strip.compressor, size)));
    strip.packed.resize(static_cast<qsizetype>(
        libdeflate_deflate_compress(strip.compressor, strip.lines.constData(), size, strip.packed.data(),
                                    static_cast<std::size_t>(strip.packed.size()))));
    strip.checksum = libdeflate_adler32(1, strip.lines.constData(), size);
}

QByteArray FastPng::encode()
{
    compressAll();
    QByteArray stream("\x78\x01", 2);
    uLong checksum = 1;
    for (const std::unique_ptr<Strip>& strip : m_strips) {
        if (strip != m_strips.back())
            openEnd(strip->packed, strip->ends);
        stream.append(strip->packed);
        checksum = adler32_combine(checksum, strip->checksum, strip->lines.size());
    }
    addNumber(stream, static_cast<quint32>(checksum));
    QByteArray header;
    addNumber(header, static_cast<quint32>(m_image.width()));
    addNumber(header, static_cast<quint32>(m_image.height()));
    header.append(char(8)).append(char(m_image.hasAlphaChannel() ? 6 : 2)).append(3, char(0));
    QByteArray bytes("\x89PNG\r\n\x1a\n", 8);
    addChunk(bytes, "IHDR", header);
    addChunk(bytes, "IDAT", stream);
    addChunk(bytes, "IEND", {});
    return bytes;
}

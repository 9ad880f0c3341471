#include "bench/FastPng.h"

#include <QElapsedTimer>
#include <QtEndian>
#include <cstring>
#include <libdeflate.h>
#include <limits>
#include <utility>

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

} // namespace

FastPng::FastPng(Filter filter, int level)
    : m_filter(filter), m_compressor(libdeflate_alloc_compressor(level))
{
}

FastPng::~FastPng()
{
    libdeflate_free_compressor(m_compressor);
}

std::unique_ptr<FastPng> FastPng::fastestFor(const QImage& image)
{
    std::unique_ptr<FastPng> fastest;
    qint64 least = std::numeric_limits<qint64>::max();
    for (const Filter filter : {Filter::None, Filter::Up}) {
        for (const int level : {1, 2}) {
            auto png = std::make_unique<FastPng>(filter, level);
            qint64 time = std::numeric_limits<qint64>::max();
            for (int i = 0; i < TRIES; ++i) {
                QElapsedTimer timer;
                timer.start();
                png->encode(image);
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

QByteArray FastPng::encode(const QImage& image)
{
    const bool alpha = image.hasAlphaChannel();
    const QImage bytesOrdered =
        image.convertToFormat(alpha ? QImage::Format_RGBA8888 : QImage::Format_RGB888);
    const auto lineSize = static_cast<std::size_t>(image.width()) * (alpha ? 4 : 3);
    const auto size = (lineSize + 1) * static_cast<std::size_t>(image.height());
    m_lines.resize(static_cast<qsizetype>(size));
    auto* out = reinterpret_cast<uchar*>(m_lines.data());
    for (int y = 0; y < image.height(); ++y) {
        const uchar* line = bytesOrdered.constScanLine(y);
        const bool up = m_filter == Filter::Up && y > 0;
        *out++ = up ? 2 : 0;
        if (up) {
            const uchar* above = bytesOrdered.constScanLine(y - 1);
            for (std::size_t i = 0; i < lineSize; ++i)
                out[i] = static_cast<uchar>(line[i] - above[i]);
        } else {
            std::memcpy(out, line, lineSize);
        }
        out += lineSize;
    }
    m_packed.resize(static_cast<qsizetype>(libdeflate_zlib_compress_bound(m_compressor, size)));
    const std::size_t packed = libdeflate_zlib_compress(
        m_compressor, m_lines.constData(), size, m_packed.data(), static_cast<std::size_t>(m_packed.size()));
    QByteArray header;
    addNumber(header, static_cast<quint32>(image.width()));
    addNumber(header, static_cast<quint32>(image.height()));
    header.append(char(8)).append(char(alpha ? 6 : 2)).append(3, char(0));
    QByteArray bytes("\x89PNG\r\n\x1a\n", 8);
    addChunk(bytes, "IHDR", header);
    addChunk(bytes, "IDAT", QByteArray::fromRawData(m_packed.constData(), static_cast<qsizetype>(packed)));
    addChunk(bytes, "IEND", {});
    return bytes;
}

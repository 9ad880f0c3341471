#include "document/PngWriter.h"

#include "support/RefusedWrites.h"

#include <QBuffer>
#include <QColorSpace>
#include <QFileInfo>
#include <QImageWriter>
#include <QtEndian>
#include <algorithm>
#include <cerrno>
#include <cstring>
#include <libdeflate.h>
#include <memory>

namespace
{

// Higher levels reduce the file size by a few percent but take twice the time.
constexpr int COMPRESSION_LEVEL = 1;
constexpr char SIGNATURE[] = "\x89PNG\r\n\x1a\n";
constexpr unsigned char FILTER_UP = 2;

struct CompressorDeleter {
    void operator()(libdeflate_compressor* compressor) const { libdeflate_free_compressor(compressor); }
};

void appendChunk(QByteArray& bytes, const char* type, const char* data, qsizetype size)
{
    char number[4];
    qToBigEndian(static_cast<quint32>(size), number);
    bytes.append(number, 4);
    const qsizetype start = bytes.size();
    bytes.append(type, 4);
    bytes.append(data, size);
    qToBigEndian(libdeflate_crc32(0, bytes.constData() + start, static_cast<std::size_t>(size) + 4), number);
    bytes.append(number, 4);
}

// Number of lines that are converted to the file's colour order at a time; few enough to stay in the cache.
constexpr int STRIP_LINES = 16;

QImage stripInFileOrder(const QImage& image, int top)
{
    const int lines = std::min(STRIP_LINES, image.height() - top);
    const QImage strip(image.constScanLine(top), image.width(), lines, image.bytesPerLine(), image.format());
    if (!image.hasAlphaChannel())
        return strip.convertToFormat(QImage::Format_RGB888);
    return strip.convertToFormat(QImage::Format_ARGB32).convertToFormat(QImage::Format_RGBA8888);
}

// Subtracts bytes, eight at a time. The top bits are handled separately, so that no byte borrows from the
// next.
void subtract(const uchar* line, const uchar* above, uchar* out, std::size_t size)
{
    constexpr quint64 TOP_BITS = 0x8080808080808080;
    std::size_t i = 0;
    for (; i + sizeof(quint64) <= size; i += sizeof(quint64)) {
        quint64 a = 0;
        quint64 b = 0;
        std::memcpy(&a, line + i, sizeof a);
        std::memcpy(&b, above + i, sizeof b);
        const quint64 difference = ((a | TOP_BITS) - (b & ~TOP_BITS)) ^ ((a ^ ~b) & TOP_BITS);
        std::memcpy(out + i, &difference, sizeof difference);
    }
    for (; i < size; ++i)
        out[i] = static_cast<uchar>(line[i] - above[i]);
}

// Returns all lines as differences to the line above: titles have large areas of one colour, where these are
// zero.
std::unique_ptr<uchar[]> filteredLines(const QImage& image, std::size_t lineSize)
{
    const auto height = static_cast<std::size_t>(image.height());
    auto filtered = std::make_unique_for_overwrite<uchar[]>((lineSize + 1) * height);
    const auto blank = std::make_unique<uchar[]>(lineSize);
    const uchar* above = blank.get();
    uchar* out = filtered.get();
    QImage previous; // keeps the pixels that above points to
    for (int top = 0; top < image.height(); top += STRIP_LINES) {
        const QImage strip = stripInFileOrder(image, top);
        for (int y = 0; y < strip.height(); ++y) {
            const uchar* line = strip.constScanLine(y);
            *out++ = FILTER_UP;
            subtract(line, above, out, lineSize);
            out += lineSize;
            above = line;
        }
        previous = strip;
    }
    return filtered;
}

QByteArray encode32(const QImage& image)
{
    const bool hasAlpha = image.hasAlphaChannel();
    const std::size_t lineSize = static_cast<std::size_t>(image.width()) * (hasAlpha ? 4 : 3);
    const std::size_t size = (lineSize + 1) * static_cast<std::size_t>(image.height());
    const auto filtered = filteredLines(image, lineSize);
    const std::unique_ptr<libdeflate_compressor, CompressorDeleter> compressor(
        libdeflate_alloc_compressor(COMPRESSION_LEVEL));
    if (!compressor)
        return {};
    const std::size_t bound = libdeflate_zlib_compress_bound(compressor.get(), size);
    const auto compressed = std::make_unique_for_overwrite<char[]>(bound);
    const std::size_t compressedSize =
        libdeflate_zlib_compress(compressor.get(), filtered.get(), size, compressed.get(), bound);
    if (compressedSize == 0)
        return {};

    QByteArray bytes;
    bytes.reserve(static_cast<qsizetype>(compressedSize) + 100);
    bytes.append(SIGNATURE, 8);
    char header[13] = {};
    qToBigEndian(static_cast<quint32>(image.width()), header);
    qToBigEndian(static_cast<quint32>(image.height()), header + 4);
    header[8] = 8;                // bits per channel
    header[9] = hasAlpha ? 6 : 2; // colour type with or without alpha
    appendChunk(bytes, "IHDR", header, sizeof header);
    if (image.dotsPerMeterX() > 0 || image.dotsPerMeterY() > 0) {
        char resolution[9];
        qToBigEndian(static_cast<quint32>(image.dotsPerMeterX()), resolution);
        qToBigEndian(static_cast<quint32>(image.dotsPerMeterY()), resolution + 4);
        resolution[8] = 1; // unit: metre
        appendChunk(bytes, "pHYs", resolution, sizeof resolution);
    }
    appendChunk(bytes, "IDAT", compressed.get(), static_cast<qsizetype>(compressedSize));
    appendChunk(bytes, "IEND", nullptr, 0);
    return bytes;
}

QByteArray encodeByQt(const QImage& image, const QByteArray& format)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QImageWriter writer(&buffer, format);
    return writer.write(image) ? bytes : QByteArray();
}

} // namespace

QByteArray PngWriter::encode(const QImage& image)
{
    if (image.isNull())
        return {};
    if (image.colorSpace().isValid() || !image.textKeys().isEmpty() || !image.offset().isNull())
        return encodeByQt(image, "png"); // Qt writes data other than pixels
    switch (image.format()) {
    case QImage::Format_RGB32:
    case QImage::Format_ARGB32:
    case QImage::Format_ARGB32_Premultiplied:
        return encode32(image);
    default:
        return encodeByQt(image, "png");
    }
}

QByteArray PngWriter::encodeFor(const QImage& image, const QString& path)
{
    const QByteArray format = QFileInfo(path).suffix().toLower().toLatin1();
    if (image.isNull() || format.isEmpty())
        return {};
    if (format == "jpe") // unknown to Qt
        return encodeByQt(image, "jpeg");
    return format == "png" ? encode(image) : encodeByQt(image, format);
}

bool PngWriter::save(const QImage& image, const QString& path, AtomicFile::Durability durability)
{
    const QByteArray bytes = encodeFor(image, path);
    return !bytes.isEmpty() &&
           AtomicFile::write(path.toStdString(), {bytes.constData(), static_cast<std::size_t>(bytes.size())},
                             durability, AtomicFile::Links::Replace);
}

bool PngWriter::saveOrKeep(const QImage& image, const QString& path, const std::string& title)
{
    const QByteArray bytes = encodeFor(image, path);
    if (bytes.isEmpty())
        return false;
    const std::string file = path.toStdString();
    if (AtomicFile::write(file, {bytes.constData(), static_cast<std::size_t>(bytes.size())},
                          AtomicFile::Durability::SyncLater, AtomicFile::Links::Replace))
        return true;
    const int error = errno;
    RefusedWrites::keep(file, bytes.toStdString(), error, title);
    return false;
}

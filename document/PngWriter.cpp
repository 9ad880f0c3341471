#include "document/PngWriter.h"

#include <QBuffer>
#include <QColorSpace>
#include <QFileInfo>
#include <QImageWriter>
#include <QtEndian>
#include <cstring>
#include <libdeflate.h>
#include <memory>

namespace
{

// Higher levels make files a few percent smaller in twice the time.
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

// The colour bytes of a line in the order of the file.
void fillLine(const QRgb* pixels, int width, bool hasAlpha, unsigned char* line)
{
    if (hasAlpha) {
        for (int x = 0; x < width; ++x) {
            const QRgb p = pixels[x];
            const quint32 bytes =
                qToLittleEndian((p & 0xFF00FF00u) | ((p >> 16) & 0xFFu) | ((p & 0xFFu) << 16));
            std::memcpy(line + 4 * x, &bytes, 4);
        }
        return;
    }
    for (int x = 0; x < width; ++x) {
        const QRgb p = pixels[x];
        line[3 * x] = static_cast<unsigned char>(p >> 16);
        line[3 * x + 1] = static_cast<unsigned char>(p >> 8);
        line[3 * x + 2] = static_cast<unsigned char>(p);
    }
}

// All lines as differences to the line above: titles have large areas of one colour, which become zeros.
std::unique_ptr<unsigned char[]> filteredLines(const QImage& image, std::size_t lineSize)
{
    const bool hasAlpha = image.hasAlphaChannel();
    const auto height = static_cast<std::size_t>(image.height());
    auto filtered = std::make_unique_for_overwrite<unsigned char[]>((lineSize + 1) * height);
    const auto lines = std::make_unique<unsigned char[]>(2 * lineSize);
    unsigned char* current = lines.get();
    unsigned char* above = current + lineSize;
    unsigned char* out = filtered.get();
    for (int y = 0; y < image.height(); ++y) {
        fillLine(reinterpret_cast<const QRgb*>(image.constScanLine(y)), image.width(), hasAlpha, current);
        *out++ = FILTER_UP;
        for (std::size_t i = 0; i < lineSize; ++i)
            out[i] = static_cast<unsigned char>(current[i] - above[i]);
        out += lineSize;
        std::swap(current, above);
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
    header[8] = 8;                // bits a channel
    header[9] = hasAlpha ? 6 : 2; // colour, with or without alpha
    appendChunk(bytes, "IHDR", header, sizeof header);
    if (image.dotsPerMeterX() > 0 || image.dotsPerMeterY() > 0) {
        char resolution[9];
        qToBigEndian(static_cast<quint32>(image.dotsPerMeterX()), resolution);
        qToBigEndian(static_cast<quint32>(image.dotsPerMeterY()), resolution + 4);
        resolution[8] = 1; // per metre
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
        return encodeByQt(image, "png"); // what is more than pixels is left to Qt
    switch (image.format()) {
    case QImage::Format_RGB32:
    case QImage::Format_ARGB32:
        return encode32(image);
    case QImage::Format_ARGB32_Premultiplied:
        return encode32(image.convertToFormat(QImage::Format_ARGB32));
    default:
        return encodeByQt(image, "png");
    }
}

bool PngWriter::save(const QImage& image, const QString& path, AtomicFile::Durability durability)
{
    if (image.isNull())
        return false;
    const QByteArray format = QFileInfo(path).suffix().toLower().toLatin1();
    if (format.isEmpty())
        return false;
    const QByteArray bytes = format == "png" ? encode(image) : encodeByQt(image, format);
    if (bytes.isEmpty())
        return false;
    return AtomicFile::write(path.toStdString(), {bytes.constData(), static_cast<std::size_t>(bytes.size())},
                             durability);
}

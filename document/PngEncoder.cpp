#include "document/PngEncoder.h"

#include "document/PngStrip.h"

#include <QByteArrayList>
#include <QThread>
#include <QtEndian>
#include <algorithm>
#include <array>
#include <atomic>
#include <cstdint>
#include <future>
#include <libdeflate.h>
#include <memory>
#include <mutex>
#include <new>
#include <system_error>
#include <utility>
#include <vector>

namespace
{

constexpr qint64 STRIP_SIZE = 1 << 20; // bytes before compression, about
constexpr int MAX_THREADS = 4;

// Compressors whose buffers are kept for the next picture.
std::mutex gMutex;
std::array<std::unique_ptr<PngStrip>, MAX_THREADS> gSpare;

std::unique_ptr<PngStrip> takeSpare()
{
    const std::lock_guard lock(gMutex);
    for (auto& spare : gSpare)
        if (spare)
            return std::move(spare);
    return std::make_unique<PngStrip>();
}

void keepSpare(std::unique_ptr<PngStrip> strip)
{
    const std::lock_guard lock(gMutex);
    const auto place = std::find(gSpare.begin(), gSpare.end(), nullptr);
    if (place != gSpare.end())
        *place = std::move(strip);
}

// Returns the parts of the picture's strips, from the first to the last; nothing when memory is lacking.
std::vector<PngStrip::Part> compressStrips(const QImage& image, int stripHeight, int threads)
{
    const int count = (image.height() - 1) / stripHeight + 1;
    std::vector<PngStrip::Part> parts(static_cast<std::size_t>(count));
    std::atomic<int> next = 0;
    std::atomic<bool> isMemoryLacking = false;
    const auto work = [&]() noexcept {
        try {
            std::unique_ptr<PngStrip> strip = takeSpare();
            for (int i = next++; i < count; i = next++) {
                const int top = i * stripHeight;
                const bool isLast = i + 1 == count;
                parts[static_cast<std::size_t>(i)] =
                    strip->compress(image, top, isLast ? image.height() : top + stripHeight,
                                    isLast ? DeflateWriter::Ending::Final : DeflateWriter::Ending::Continued);
            }
            keepSpare(std::move(strip));
        } catch (const std::bad_alloc&) {
            isMemoryLacking = true;
        }
    };
    {
        std::vector<std::future<void>> helpers; // waited for at the end of the block
        try {
            for (int i = 1; i < std::min(threads, count); ++i)
                helpers.push_back(std::async(std::launch::async, work));
        } catch (const std::system_error&) {
            // without another thread this one does all
        }
        work();
    }
    if (isMemoryLacking)
        parts.clear();
    return parts;
}

QByteArray number(std::uint32_t value)
{
    QByteArray bytes(sizeof value, Qt::Uninitialized);
    qToBigEndian(value, bytes.data());
    return bytes;
}

void appendChunk(QByteArray& file, const char* type, const QByteArrayList& parts)
{
    const qsizetype start = file.size();
    file.append(number(0)).append(type);
    for (const QByteArray& part : parts)
        file.append(part);
    const qsizetype size = file.size() - start - 8;
    qToBigEndian(static_cast<std::uint32_t>(size), file.data() + start);
    file.append(
        number(libdeflate_crc32(0, file.constData() + start + 4, static_cast<std::size_t>(size) + 4)));
}

// Appends the parts as one zlib stream. Each has a chunk of its own, because decoders limit the size of a
// chunk.
void appendStream(QByteArray& file, const std::vector<PngStrip::Part>& parts)
{
    std::uint32_t adler = 1;
    for (const PngStrip::Part& part : parts) {
        QByteArrayList data = {part.bytes};
        adler = PngStrip::joinedSum(adler, part);
        if (&part == &parts.front())
            data.prepend(QByteArray("\x78\x01", 2)); // compressed fast, repetitions within 32 kB
        if (&part == &parts.back())
            data.append(number(adler));
        appendChunk(file, "IDAT", data);
    }
}

} // namespace

QByteArray PngEncoder::encode(const QImage& image)
{
    const qint64 height = STRIP_SIZE / std::max<qint64>(image.bytesPerLine(), 1);
    return encode(image, static_cast<int>(std::max<qint64>(height, 1)),
                  std::min(QThread::idealThreadCount(), MAX_THREADS));
}

QByteArray PngEncoder::encode(const QImage& image, int stripHeight, int threads)
{
    const QImage::Format format = image.format();
    if (format != QImage::Format_RGB32 && format != QImage::Format_ARGB32 &&
        format != QImage::Format_ARGB32_Premultiplied)
        return {};
    const bool isOdd =
        format == QImage::Format_ARGB32_Premultiplied && image.width() % PngStrip::WIDTH_STEP != 0;
    const std::vector<PngStrip::Part> parts =
        compressStrips(isOdd ? image.convertToFormat(QImage::Format_ARGB32) : image, stripHeight, threads);
    if (parts.empty())
        return {};

    QByteArray file("\x89PNG\r\n\x1a\n", 8);
    const char colorType = image.hasAlphaChannel() ? 6 : 2;
    appendChunk(file, "IHDR",
                {number(image.width()), number(image.height()),
                 QByteArray("\x08", 1) + colorType + QByteArray(3, '\0')});
    if (image.dotsPerMeterX() > 0 || image.dotsPerMeterY() > 0)
        appendChunk(file, "pHYs",
                    {number(image.dotsPerMeterX()), number(image.dotsPerMeterY()), QByteArray("\x01", 1)});
    appendStream(file, parts);
    appendChunk(file, "IEND", {});
    return file;
}

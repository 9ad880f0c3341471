// Encodes a picture that the bytes describe, and decodes it again: the pixels are the same, however the lines
// are split into strips. The first four bytes are width, height of the strips, and format; five bytes each
// follow for a run of pixels.
#include "document/PngEncoder.h"

#include <QImage>
#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <vector>

namespace
{

constexpr std::size_t HEADER = 4;
constexpr std::size_t RUN = 5;
constexpr std::size_t MAX_PIXELS = 1 << 18;

// Appends a run: as many pixels as the first byte says, or for 0 the rest of the line as it is in the line
// above.
void appendRun(std::vector<QRgb>& pixels, std::size_t width, const std::uint8_t* run)
{
    QRgb pixel = 0;
    std::memcpy(&pixel, run + 1, sizeof pixel);
    pixels.insert(pixels.end(), run[0], pixel);
    if (run[0] > 0)
        return;
    do {
        pixels.push_back(pixels.size() < width ? 0 : pixels[pixels.size() - width]);
    } while (pixels.size() % width != 0);
}

QImage pictureOf(const std::uint8_t* data, std::size_t size)
{
    const std::size_t width = 1 + data[0] + 16 * data[1];
    std::vector<QRgb> pixels;
    for (std::size_t i = HEADER; i + RUN <= size && pixels.size() < MAX_PIXELS; i += RUN)
        appendRun(pixels, width, data + i);
    pixels.resize(std::max(width, pixels.size() / width * width));
    constexpr QImage::Format FORMATS[] = {QImage::Format_RGB32, QImage::Format_ARGB32,
                                          QImage::Format_ARGB32_Premultiplied};
    const int bytesPerLine = static_cast<int>(width * sizeof(QRgb));
    return QImage(reinterpret_cast<const uchar*>(pixels.data()), static_cast<int>(width),
                  static_cast<int>(pixels.size() / width), bytesPerLine, FORMATS[data[3] % 3])
        .copy();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    if (size < HEADER)
        return 0;
    const QImage image = pictureOf(data, size);
    const QByteArray file = PngEncoder::encode(image, 1 + data[2], 1);
    const QImage read = QImage::fromData(file, "png");
    if (read.isNull() || read != image.convertToFormat(read.format()))
        std::abort(); // another picture
    if (file != PngEncoder::encode(image, 1 + data[2], 2))
        std::abort(); // depends on the threads
    return 0;
}

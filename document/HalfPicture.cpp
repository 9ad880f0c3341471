#include "document/HalfPicture.h"

#include <cstdint>
#include <cstring>

namespace
{

constexpr int GROUP = 4; // pixels that are made at once if they are blank

// Every second channel of two pixels.
constexpr std::uint64_t CHANNELS = 0x00ff00ff00ff00ff;

struct Pair {
    explicit Pair(const QRgb* pixels) { std::memcpy(&bits, pixels, sizeof bits); }

    std::uint64_t bits;
};

constexpr std::uint32_t meanOfChannels(std::uint64_t upper, std::uint64_t lower)
{
    const std::uint64_t sums = (upper & CHANNELS) + (lower & CHANNELS);
    return static_cast<std::uint32_t>((sums + (sums >> 32)) >> 2 & CHANNELS);
}

constexpr QRgb mean(std::uint64_t upper, std::uint64_t lower)
{
    return meanOfChannels(upper, lower) | meanOfChannels(upper >> 8, lower >> 8) << 8;
}

bool isBlank(const QRgb* upper, const QRgb* lower)
{
    std::uint64_t bits = 0;
    for (int i = 0; i < GROUP; ++i)
        bits |= Pair(upper + 2 * i).bits | Pair(lower + 2 * i).bits;
    return bits == 0;
}

void reduceLines(const QRgb* upper, const QRgb* lower, QRgb* out, int width)
{
    int x = 0;
    for (; x + GROUP <= width; x += GROUP) {
        if (isBlank(upper + 2 * x, lower + 2 * x)) {
            std::memset(out + x, 0, GROUP * sizeof(QRgb));
            continue;
        }
        for (int i = x; i < x + GROUP; ++i)
            out[i] = mean(Pair(upper + 2 * i).bits, Pair(lower + 2 * i).bits);
    }
    for (; x < width; ++x)
        out[x] = mean(Pair(upper + 2 * x).bits, Pair(lower + 2 * x).bits);
}

} // namespace

void HalfPicture::reduce(const QImage& picture, QImage& half)
{
    const auto line = [&](int y) { return reinterpret_cast<const QRgb*>(picture.constScanLine(y)); };
    for (int y = 0; y < half.height(); ++y)
        reduceLines(line(2 * y), line(2 * y + 1), reinterpret_cast<QRgb*>(half.scanLine(y)), half.width());
}

#include "document/PictureGuard.h"

#include <QtEndian>
#include <algorithm>
#include <array>
#include <map>
#include <optional>
#include <string_view>

namespace
{

using namespace std::string_view_literals;

constexpr int BITS_OF_BYTE = 8;
constexpr quint64 DECODED_PIXEL_BYTES = 4;

// Reads numbers from the bytes. A read beyond the end gives 0 and makes all further reads fail.
class Reader
{
public:
    explicit Reader(std::string_view bytes) : m_bytes(bytes) {}

    quint64 size() const { return m_bytes.size(); }
    bool hasFailed() const { return m_hasFailed; }
    bool has(quint64 at, quint64 count) const { return at <= size() && count <= size() - at; }

    std::string_view text(quint64 at, quint64 count)
    {
        return claim(at, count) ? m_bytes.substr(at, count) : std::string_view();
    }
    quint8 byte(quint64 at) { return number<quint8>(at, true); }
    template <typename T>
    T big(quint64 at)
    {
        return number<T>(at, true);
    }
    template <typename T>
    T little(quint64 at)
    {
        return number<T>(at, false);
    }
    template <typename T>
    T number(quint64 at, bool isBigEndian)
    {
        if (!claim(at, sizeof(T)))
            return 0;
        const char* const place = m_bytes.data() + at;
        return isBigEndian ? qFromBigEndian<T>(place) : qFromLittleEndian<T>(place);
    }

private:
    bool claim(quint64 at, quint64 count)
    {
        m_hasFailed = m_hasFailed || !has(at, count);
        return !m_hasFailed;
    }

    std::string_view m_bytes;
    bool m_hasFailed = false;
};

// Returns the size of a picture whose decoder needs pixelBytes bytes per pixel, or nothing if it exceeds a
// limit.
std::optional<QSize> limited(qint64 width, qint64 height, quint64 pixelBytes)
{
    if (width < 1 || height < 1 || width > PictureGuard::MAX_SIDE || height > PictureGuard::MAX_SIDE)
        return {};
    const quint64 pixels = static_cast<quint64>(width) * static_cast<quint64>(height);
    if (pixelBytes > quint64(PictureGuard::MAX_DECODED_BYTES) / pixels)
        return {};
    return QSize(static_cast<int>(width), static_cast<int>(height));
}

// --- PNG ------------------------------------------------------------------------------------------------

constexpr auto PNG_SIGNATURE = "\x89PNG\r\n\x1a\n"sv;

std::optional<QSize> pngHeader(Reader& reader, quint64 at)
{
    constexpr quint8 SIXTEEN_BITS = 16;
    constexpr quint64 DEEP_PIXEL_BYTES = 8;
    const auto width = reader.big<quint32>(at);
    const auto height = reader.big<quint32>(at + 4);
    const bool isDeep = reader.byte(at + 8) == SIXTEEN_BITS;
    return limited(width, height, isDeep ? DEEP_PIXEL_BYTES : DECODED_PIXEL_BYTES);
}

// Requires every chunk, up to the end chunk, to be complete.
std::optional<QSize> pngSize(Reader& reader)
{
    constexpr quint64 AROUND_DATA = 12; // length, type and check sum
    constexpr quint32 HEADER_BYTES = 13;
    std::optional<QSize> size;
    for (quint64 at = PNG_SIGNATURE.size();;) {
        const auto length = reader.big<quint32>(at);
        const std::string_view type = reader.text(at + 4, 4);
        if (reader.hasFailed() || !reader.has(at, AROUND_DATA + length))
            return {};
        const bool isHeader = type == "IHDR"sv;
        if (isHeader == size.has_value() || (isHeader && length != HEADER_BYTES))
            return {};
        if (isHeader && !(size = pngHeader(reader, at + 8)))
            return {};
        if (type == "IEND"sv)
            return size;
        at += AROUND_DATA + length;
    }
}

// --- BMP ------------------------------------------------------------------------------------------------

std::optional<QSize> bmpSize(Reader& reader)
{
    constexpr quint64 INFO = 14;
    constexpr quint32 OLD_INFO_BYTES = 12;
    constexpr quint32 NEW_INFO_BYTES = 40;
    constexpr quint32 MOST_COLORS = 256;
    constexpr quint32 FIRST_RUN_LENGTH_KIND = 1;
    constexpr quint32 LAST_RUN_LENGTH_KIND = 2;
    const auto pixelsAt = reader.little<quint32>(10);
    const auto infoBytes = reader.little<quint32>(INFO);
    const bool isOld = infoBytes == OLD_INFO_BYTES;
    if (!isOld && infoBytes < NEW_INFO_BYTES)
        return {};
    const qint64 width = isOld ? reader.little<quint16>(INFO + 4) : reader.little<qint32>(INFO + 4);
    const qint64 height = isOld ? reader.little<quint16>(INFO + 6) : reader.little<qint32>(INFO + 8);
    const auto bits = reader.little<quint16>(isOld ? INFO + 10 : INFO + 14);
    const auto kind = isOld ? 0 : reader.little<quint32>(INFO + 16);
    const auto colors = isOld ? 0 : reader.little<quint32>(INFO + 32);
    constexpr std::array<int, 6> DEPTHS{1, 4, 8, 16, 24, 32};
    if (reader.hasFailed() || !reader.has(INFO, infoBytes) || colors > MOST_COLORS ||
        std::find(DEPTHS.begin(), DEPTHS.end(), bits) == DEPTHS.end())
        return {};
    const std::optional<QSize> size = limited(width, height < 0 ? -height : height, DECODED_PIXEL_BYTES);
    if (!size)
        return {};
    const bool isRunLength = kind == FIRST_RUN_LENGTH_KIND || kind == LAST_RUN_LENGTH_KIND;
    const quint64 lineBytes = (static_cast<quint64>(size->width()) * bits + 31) / 32 * 4;
    const quint64 pixelBytes = isRunLength ? 0 : lineBytes * static_cast<quint64>(size->height());
    return reader.has(pixelsAt, pixelBytes) ? size : std::nullopt;
}

// --- JPEG -----------------------------------------------------------------------------------------------

constexpr int MOST_SCANS = 100; // a progressive picture normally has about ten
constexpr quint8 JPEG_ESCAPE = 0xFF;

bool isFrameMarker(quint8 marker)
{
    return marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
}

bool isBareMarker(quint8 marker)
{
    return marker == 0x01 || (marker >= 0xD0 && marker <= 0xD8);
}

// For progressive pictures and for separate scans per component, the decoder keeps all coefficients of two
// bytes each.
std::optional<QSize> jpegFrame(Reader& reader, quint64 at, quint16 length)
{
    constexpr quint16 AROUND_COMPONENTS = 8;
    constexpr quint16 COMPONENT_BYTES = 3;
    constexpr quint64 COEFFICIENT_BYTES = 2;
    const quint64 components = reader.byte(at + 7);
    if (components < 1 || components > 4 || length != AROUND_COMPONENTS + COMPONENT_BYTES * components)
        return {};
    quint64 blocks = 0; // sampling blocks of all components, and of the largest one
    quint64 largest = 1;
    for (quint64 i = 0; i < components; ++i) {
        const quint8 sampling = reader.byte(at + 9 + COMPONENT_BYTES * i);
        const quint64 area = quint64(sampling >> 4) * (sampling & 15);
        if (area < 1 || area > 16)
            return {};
        blocks += area;
        largest = std::max(largest, area);
    }
    const quint64 coefficients = (blocks * COEFFICIENT_BYTES + largest - 1) / largest;
    return limited(reader.big<quint16>(at + 5), reader.big<quint16>(at + 3),
                   std::max(coefficients, DECODED_PIXEL_BYTES));
}

// Returns the position of the marker that follows the data of a scan, or the end of the file.
quint64 endOfScan(Reader& reader, std::string_view all, quint64 at)
{
    while ((at = all.find(static_cast<char>(JPEG_ESCAPE), at)) != std::string_view::npos &&
           at + 1 < reader.size()) {
        const quint8 next = reader.byte(at + 1);
        if (next != 0 && next != JPEG_ESCAPE && !(next >= 0xD0 && next <= 0xD7))
            return at;
        ++at;
    }
    return reader.size();
}

// Accepts a picture that is truncated within its data: the available part is shown.
std::optional<QSize> jpegSize(Reader& reader)
{
    constexpr quint8 SCAN = 0xDA;
    constexpr quint8 END = 0xD9;
    std::optional<QSize> size;
    int scans = 0;
    const std::string_view all = reader.text(0, reader.size());
    for (quint64 at = 2; at < reader.size();) {
        if (reader.byte(at) != JPEG_ESCAPE)
            return {};
        const quint8 marker = reader.byte(at + 1);
        if (marker == END && size && scans > 0)
            return size;
        if (marker == JPEG_ESCAPE || isBareMarker(marker)) {
            at += marker == JPEG_ESCAPE ? 1 : 2;
            continue;
        }
        const auto length = reader.big<quint16>(at + 2);
        if (reader.hasFailed() || length < 2 || !reader.has(at + 2, length))
            return {};
        if (isFrameMarker(marker) && (size || !(size = jpegFrame(reader, at + 2, length))))
            return {};
        if (marker == SCAN && (!size || ++scans > MOST_SCANS))
            return {};
        at += 2 + length;
        if (marker == SCAN)
            at = endOfScan(reader, all, at);
    }
    return scans > 0 && !reader.hasFailed() ? size : std::nullopt;
}

// --- GIF ------------------------------------------------------------------------------------------------

quint64 gifColorBytes(quint8 flags)
{
    return (flags & 0x80) != 0 ? quint64(3) << ((flags & 7) + 1) : 0;
}

// Returns the position behind a sequence of length-prefixed data blocks, or nothing if it is incomplete.
std::optional<quint64> endOfGifBlocks(Reader& reader, quint64 at)
{
    for (;;) {
        const quint64 length = reader.byte(at);
        ++at;
        if (reader.hasFailed() || !reader.has(at, length))
            return {};
        if (length == 0)
            return at;
        at += length;
    }
}

// Only the first frame is shown, but the decoder may read all frames.
std::optional<QSize> gifSize(Reader& reader)
{
    constexpr quint8 EXTENSION = 0x21;
    constexpr quint8 FRAME = 0x2C;
    constexpr quint8 END = 0x3B;
    constexpr quint64 PICTURE_AND_STORE_BYTES = 2 * DECODED_PIXEL_BYTES;
    const std::optional<QSize> size =
        limited(reader.little<quint16>(6), reader.little<quint16>(8), DECODED_PIXEL_BYTES);
    if (!size)
        return {};
    bool hasFrame = false;
    for (quint64 at = 13 + gifColorBytes(reader.byte(10)); at < reader.size();) {
        const quint8 kind = reader.byte(at);
        if (kind == END)
            break;
        quint64 blocksAt = at + 2;
        if (kind == FRAME) {
            const int right = reader.little<quint16>(at + 1) + reader.little<quint16>(at + 5);
            const int bottom = reader.little<quint16>(at + 3) + reader.little<quint16>(at + 7);
            if (!limited(right, bottom, PICTURE_AND_STORE_BYTES))
                return {};
            hasFrame = true;
            blocksAt = at + 11 + gifColorBytes(reader.byte(at + 9));
        } else if (kind != EXTENSION) {
            return {};
        }
        const std::optional<quint64> end = endOfGifBlocks(reader, blocksAt);
        if (!end)
            return {};
        at = *end;
    }
    return hasFrame && !reader.hasFailed() ? size : std::nullopt;
}

// --- TIFF -----------------------------------------------------------------------------------------------

enum TiffTag : quint16 {
    ImageWidth = 256,
    ImageLength = 257,
    BitsPerSample = 258,
    SamplesPerPixel = 277,
    RowsPerStrip = 278,
    TileWidth = 322,
    TileLength = 323,
};

// Returns the fields of a directory with the first value of each, or nothing if the data of a field is not in
// the file.
std::optional<std::map<quint16, quint64>> tiffFields(Reader& reader, bool isBigEndian, quint64 at)
{
    constexpr quint64 ENTRY_BYTES = 12;
    constexpr std::array<quint64, 13> TYPE_BYTES{0, 1, 1, 2, 4, 8, 1, 1, 2, 4, 8, 4, 8};
    constexpr quint16 SHORT = 3;
    std::map<quint16, quint64> fields;
    const auto count = reader.number<quint16>(at, isBigEndian);
    if (reader.hasFailed() || count == 0 || !reader.has(at + 2, count * ENTRY_BYTES + 4))
        return {};
    for (quint64 entry = at + 2; entry < at + 2 + count * ENTRY_BYTES; entry += ENTRY_BYTES) {
        const auto type = reader.number<quint16>(entry + 2, isBigEndian);
        const quint64 values = reader.number<quint32>(entry + 4, isBigEndian);
        if (type == 0 || type >= TYPE_BYTES.size())
            return {};
        const quint64 bytes = values * TYPE_BYTES[type];
        const quint64 place = bytes <= 4 ? entry + 8 : reader.number<quint32>(entry + 8, isBigEndian);
        if (!reader.has(place, bytes))
            return {};
        const auto tag = reader.number<quint16>(entry, isBigEndian);
        fields.emplace(tag, type == SHORT           ? reader.number<quint16>(place, isBigEndian)
                            : TYPE_BYTES[type] == 1 ? reader.byte(place)
                                                    : reader.number<quint32>(place, isBigEndian));
    }
    if (reader.hasFailed())
        return {};
    return fields;
}

// Checks only the first directory, because only the first picture of a file is shown. Files of more than 4 GB
// have another signature and are refused.
std::optional<QSize> tiffSize(Reader& reader)
{
    const bool isBigEndian = reader.text(0, 2) == "MM"sv;
    const auto found = tiffFields(reader, isBigEndian, reader.number<quint32>(4, isBigEndian));
    if (!found)
        return {};
    const auto field = [&](TiffTag tag, quint64 missing) {
        const auto entry = found->find(tag);
        return entry == found->end() ? missing : entry->second;
    };
    constexpr quint64 MOST_SAMPLE_BITS = 64;
    constexpr quint64 MOST_SAMPLES = 16;
    const quint64 bits = field(BitsPerSample, 1);
    const quint64 samples = field(SamplesPerPixel, 1);
    if (bits < 1 || bits > MOST_SAMPLE_BITS || samples < 1 || samples > MOST_SAMPLES)
        return {};
    // The decoder needs memory for a strip or tile as stored and for the whole picture.
    const quint64 pixelBytes =
        std::max((bits * samples + BITS_OF_BYTE - 1) / BITS_OF_BYTE, DECODED_PIXEL_BYTES);
    const auto side = [](quint64 length) { return static_cast<qint64>(std::min<quint64>(length, 1 << 30)); };
    const qint64 tileWidth = side(field(TileWidth, 1));
    const qint64 tileLength = side(field(TileLength, 1));
    if (!limited(tileWidth, tileLength, pixelBytes))
        return {};
    return limited(side(field(ImageWidth, 0)), side(field(ImageLength, 0)), pixelBytes);
}

struct Format {
    std::string_view signature;
    const char* name; // Qt's name of the format
    std::optional<QSize> (*size)(Reader&);
};

constexpr std::array<Format, 7> FORMATS{{
    {PNG_SIGNATURE, "png", pngSize},
    {"BM"sv, "bmp", bmpSize},
    {"\xFF\xD8\xFF"sv, "jpeg", jpegSize},
    {"GIF87a"sv, "gif", gifSize},
    {"GIF89a"sv, "gif", gifSize},
    {"II*\0"sv, "tiff", tiffSize},
    {"MM\0*"sv, "tiff", tiffSize},
}};

const Format* formatOf(std::string_view bytes)
{
    const auto* const found = std::find_if(FORMATS.begin(), FORMATS.end(), [bytes](const Format& format) {
        return bytes.starts_with(format.signature);
    });
    return found == FORMATS.end() ? nullptr : found;
}

} // namespace

PictureGuard::PictureGuard(const QByteArray& bytes)
{
    const std::string_view view(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    const Format* const format = formatOf(view);
    if (!format)
        return;
    Reader reader(view);
    const std::optional<QSize> size = format->size(reader);
    if (!size)
        return;
    m_format = format->name;
    m_size = *size;
}

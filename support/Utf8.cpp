#include "support/Utf8.h"

#include <cstdint>
#include <cstring>

namespace
{

bool isContinuation(unsigned char byte)
{
    return (byte & 0xC0) == 0x80;
}

// Returns the length of the well-formed multi-byte sequence at p, or 0 if there is none.
int sequenceLength(const unsigned char* p, const unsigned char* end)
{
    const unsigned char lead = *p;
    const int length = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
    if (lead < 0xC2 || lead > 0xF4 || end - p < length)
        return 0;
    char32_t code = lead & (0xFF >> (length + 1));
    for (int i = 1; i < length; ++i) {
        if (!isContinuation(p[i]))
            return 0;
        code = (code << 6) | (p[i] & 0x3F);
    }
    const bool isOverlong = (length == 3 && code < 0x800) || (length == 4 && code < 0x10000);
    const bool isSurrogate = code >= 0xD800 && code <= 0xDFFF;
    return isOverlong || isSurrogate || code > 0x10FFFF ? 0 : length;
}

} // namespace

bool Utf8::isValid(std::string_view bytes)
{
    const auto* p = reinterpret_cast<const unsigned char*>(bytes.data());
    const unsigned char* const end = p + bytes.size();
    while (p != end) {
        std::uint64_t block[2];
        if (end - p >= static_cast<std::ptrdiff_t>(sizeof block)) {
            std::memcpy(block, p, sizeof block);
            if (((block[0] | block[1]) & 0x8080808080808080u) == 0) {
                p += sizeof block;
                continue;
            }
        }
        if (*p < 0x80) {
            ++p;
            continue;
        }
        const int length = sequenceLength(p, end);
        if (length == 0)
            return false;
        p += length;
    }
    return true;
}

std::size_t Utf8::lengthAt(std::string_view bytes, std::size_t index)
{
    const auto* const start = reinterpret_cast<const unsigned char*>(bytes.data());
    const unsigned char* const p = start + index;
    return *p < 0x80 ? 1 : static_cast<std::size_t>(sequenceLength(p, start + bytes.size()));
}

std::string Utf8::repaired(std::string_view bytes)
{
    static constexpr std::string_view REPLACEMENT = "\xEF\xBF\xBD";
    std::string result;
    result.reserve(bytes.size());
    for (std::size_t i = 0; i < bytes.size();) {
        const std::size_t length = lengthAt(bytes, i);
        result.append(length == 0 ? REPLACEMENT : bytes.substr(i, length));
        i += length == 0 ? 1 : length;
    }
    return result;
}

#include "messaging/ptc/CPack.h"

#include "messaging/ptc/PackTag.h"

#include <bit>
#include <cstring>

namespace
{

// Writes the tag and then the lowest bytes of value, most significant byte first.
unsigned long putTagged(unsigned char* p, unsigned char tag, std::uint64_t value, int bytes)
{
    *p++ = tag;
    for (int shift = (bytes - 1) * 8; shift >= 0; shift -= 8)
        *p++ = static_cast<unsigned char>(value >> shift);
    return 1UL + static_cast<unsigned long>(bytes);
}

} // namespace

unsigned long CPack::pack_nil(unsigned char* p)
{
    return putTagged(p, PackTag::NIL, 0, 0);
}

unsigned long CPack::pack_bool(unsigned char* p, bool value)
{
    return putTagged(p, value ? PackTag::TRUE_VALUE : PackTag::FALSE_VALUE, 0, 0);
}

unsigned long CPack::pack_float(unsigned char* p, float value)
{
    return putTagged(p, PackTag::FLOAT, std::bit_cast<std::uint32_t>(value), 4);
}

unsigned long CPack::pack_double(unsigned char* p, double value)
{
    return putTagged(p, PackTag::DOUBLE, std::bit_cast<std::uint64_t>(value), 8);
}

unsigned long CPack::pack_fixuint(unsigned char* p, std::uint8_t value)
{
    *p = value & PackTag::LAST_POSITIVE_FIX;
    return 1;
}

unsigned long CPack::pack_uint8(unsigned char* p, std::uint8_t value)
{
    return putTagged(p, PackTag::UINT8, value, 1);
}

unsigned long CPack::pack_uint16(unsigned char* p, std::uint16_t value)
{
    return putTagged(p, PackTag::UINT16, value, 2);
}

unsigned long CPack::pack_uint32(unsigned char* p, std::uint32_t value)
{
    return putTagged(p, PackTag::UINT32, value, 4);
}

unsigned long CPack::pack_uint64(unsigned char* p, std::uint64_t value)
{
    return putTagged(p, PackTag::UINT64, value, 8);
}

unsigned long CPack::pack_fixint(unsigned char* p, std::int8_t value)
{
    *p = static_cast<unsigned char>(value) | PackTag::FIRST_NEGATIVE_FIX;
    return 1;
}

unsigned long CPack::pack_int8(unsigned char* p, std::int8_t value)
{
    return putTagged(p, PackTag::INT8, static_cast<std::uint64_t>(value), 1);
}

unsigned long CPack::pack_int16(unsigned char* p, std::int16_t value)
{
    return putTagged(p, PackTag::INT16, static_cast<std::uint64_t>(value), 2);
}

unsigned long CPack::pack_int32(unsigned char* p, std::int32_t value)
{
    return putTagged(p, PackTag::INT32, static_cast<std::uint64_t>(value), 4);
}

unsigned long CPack::pack_int64(unsigned char* p, std::int64_t value)
{
    return putTagged(p, PackTag::INT64, static_cast<std::uint64_t>(value), 8);
}

unsigned long CPack::pack_uint(unsigned char* p, unsigned int value)
{
    if (value < 0x80)
        return pack_fixuint(p, static_cast<std::uint8_t>(value));
    if (value < 0x100)
        return pack_uint8(p, static_cast<std::uint8_t>(value));
    if (value < 0x10000)
        return pack_uint16(p, static_cast<std::uint16_t>(value));
    return pack_uint32(p, value);
}

unsigned long CPack::pack_int(unsigned char* p, int value)
{
    if (value >= 0)
        return pack_uint(p, static_cast<unsigned int>(value));
    if (value >= -32)
        return pack_fixint(p, static_cast<std::int8_t>(value));
    if (value >= INT8_MIN)
        return pack_int8(p, static_cast<std::int8_t>(value));
    if (value >= INT16_MIN)
        return pack_int16(p, static_cast<std::int16_t>(value));
    return pack_int32(p, value);
}

unsigned long CPack::pack_raw_header(unsigned char* p, std::uint32_t length)
{
    if (length <= PackTag::MAX_FIX_RAW) {
        *p = static_cast<unsigned char>(PackTag::FIRST_FIX_RAW | length);
        return 1;
    }
    if (length < 0x10000)
        return putTagged(p, PackTag::RAW16, length, 2);
    return putTagged(p, PackTag::RAW32, length, 4);
}

unsigned long CPack::pack_raw(unsigned char* p, const void* data, std::uint32_t length)
{
    const unsigned long header = pack_raw_header(p, length);
    if (length > 0)
        std::memcpy(p + header, data, length);
    return header + length;
}

unsigned long CPack::pack_array_header(unsigned char*, std::uint32_t)
{
    return 0;
}

unsigned long CPack::pack_map_header(unsigned char*, std::uint32_t)
{
    return 0;
}

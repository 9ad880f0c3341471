#pragma once

#include <cstdint>

// Packs one value into memory that the caller provides and returns the number of bytes written (at most 9,
// except for raw data). Multi-byte values are big-endian.
class CPack
{
public:
    static constexpr unsigned long MAX_SCALAR_SIZE = 9;

    static unsigned long pack_nil(unsigned char* p);
    static unsigned long pack_bool(unsigned char* p, bool value);
    static unsigned long pack_float(unsigned char* p, float value);
    static unsigned long pack_double(unsigned char* p, double value);
    // For values from 0 to 127.
    static unsigned long pack_fixuint(unsigned char* p, std::uint8_t value);
    static unsigned long pack_uint8(unsigned char* p, std::uint8_t value);
    static unsigned long pack_uint16(unsigned char* p, std::uint16_t value);
    static unsigned long pack_uint32(unsigned char* p, std::uint32_t value);
    static unsigned long pack_uint64(unsigned char* p, std::uint64_t value);
    // For values from -32 to -1.
    static unsigned long pack_fixint(unsigned char* p, std::int8_t value);
    static unsigned long pack_int8(unsigned char* p, std::int8_t value);
    static unsigned long pack_int16(unsigned char* p, std::int16_t value);
    static unsigned long pack_int32(unsigned char* p, std::int32_t value);
    static unsigned long pack_int64(unsigned char* p, std::int64_t value);
    // Pack the value in its shortest form.
    static unsigned long pack_uint(unsigned char* p, unsigned int value);
    static unsigned long pack_int(unsigned char* p, int value);
    static unsigned long pack_raw_header(unsigned char* p, std::uint32_t length);
    // Packs the header and the bytes.
    static unsigned long pack_raw(unsigned char* p, const void* data, std::uint32_t length);
    // The format has neither arrays nor maps: nothing is written, and 0 is returned.
    static unsigned long pack_array_header(unsigned char* p, std::uint32_t count);
    static unsigned long pack_map_header(unsigned char* p, std::uint32_t count);
};

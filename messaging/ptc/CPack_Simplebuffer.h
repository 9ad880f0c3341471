// Packs one value at the end of a buffer. Each returns true on success, false when there is no memory.
#pragma once

#include "messaging/ptc/CSimpleBuffer.h"

#include <cstdint>
#include <string>

class CPack_Simplebuffer
{
public:
    static bool pack_simplebuffer_nil(simplebuffer* buffer);
    static bool pack_simplebuffer_bool(simplebuffer* buffer, bool value);
    static bool pack_simplebuffer_float(simplebuffer* buffer, float value);
    static bool pack_simplebuffer_double(simplebuffer* buffer, double value);
    static bool pack_simplebuffer_fixint(simplebuffer* buffer, std::int8_t value);
    static bool pack_simplebuffer_fixuint(simplebuffer* buffer, std::uint8_t value);
    static bool pack_simplebuffer_int8(simplebuffer* buffer, std::int8_t value);
    static bool pack_simplebuffer_int16(simplebuffer* buffer, std::int16_t value);
    static bool pack_simplebuffer_int32(simplebuffer* buffer, std::int32_t value);
    static bool pack_simplebuffer_int64(simplebuffer* buffer, std::int64_t value);
    static bool pack_simplebuffer_uint8(simplebuffer* buffer, std::uint8_t value);
    static bool pack_simplebuffer_uint16(simplebuffer* buffer, std::uint16_t value);
    static bool pack_simplebuffer_uint32(simplebuffer* buffer, std::uint32_t value);
    static bool pack_simplebuffer_uint64(simplebuffer* buffer, std::uint64_t value);
    // The smallest form of the value.
    static bool pack_simplebuffer_int(simplebuffer* buffer, int value);
    static bool pack_simplebuffer_uint(simplebuffer* buffer, unsigned int value);
    static bool pack_simplebuffer_raw_header(simplebuffer* buffer, std::uint32_t length);
    static bool pack_simplebuffer_raw(simplebuffer* buffer, const void* data, std::uint32_t length);
    // A raw of the bytes and a NUL, which the length counts.
    static bool pack_simplebuffer_string(simplebuffer* buffer, const std::string& text);
    // The same of the multi-byte form; see support/LocaleText.h.
    static bool pack_simplebuffer_wstring(simplebuffer* buffer, const std::wstring& text);
    // The format has no arrays: writes nothing and returns 0.
    static unsigned long pack_simplebuffer_array_header(simplebuffer* buffer, std::uint32_t count);
};

#pragma once

#include "messaging/ptc/CSimpleBuffer.h"

#include <cstdint>
#include <string>

// Appends packed values to a buffer. Each function returns false if memory is short.
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
    // Pack the value in its shortest form.
    static bool pack_simplebuffer_int(simplebuffer* buffer, int value);
    static bool pack_simplebuffer_uint(simplebuffer* buffer, unsigned int value);
    static bool pack_simplebuffer_raw_header(simplebuffer* buffer, std::uint32_t length);
    static bool pack_simplebuffer_raw(simplebuffer* buffer, const void* data, std::uint32_t length);
    // Packs the text and a terminating NUL as raw data; the length includes the NUL.
    static bool pack_simplebuffer_string(simplebuffer* buffer, const std::string& text);
    // Packs the multi-byte form of the text in the same way; see support/LocaleText.h.
    static bool pack_simplebuffer_wstring(simplebuffer* buffer, const std::wstring& text);
    // The format has no arrays: writes nothing and returns 0.
    static unsigned long pack_simplebuffer_array_header(simplebuffer* buffer, std::uint32_t count);
};

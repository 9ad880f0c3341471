#include "messaging/ptc/CPack_Simplebuffer.h"

#include "messaging/ptc/CPack.h"
#include "support/LocaleText.h"

namespace
{

bool writePacked(simplebuffer* buffer, const unsigned char* bytes, unsigned long count)
{
    return CSimpleBuffer::simplebuffer_write(buffer, bytes, count);
}

} // namespace

bool CPack_Simplebuffer::pack_simplebuffer_nil(simplebuffer* buffer)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_nil(bytes));
}

bool CPack_Simplebuffer::pack_simplebuffer_bool(simplebuffer* buffer, bool value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_bool(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_float(simplebuffer* buffer, float value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_float(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_double(simplebuffer* buffer, double value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_double(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_fixint(simplebuffer* buffer, std::int8_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_fixint(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_fixuint(simplebuffer* buffer, std::uint8_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_fixuint(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_int8(simplebuffer* buffer, std::int8_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_int8(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_int16(simplebuffer* buffer, std::int16_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_int16(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_int32(simplebuffer* buffer, std::int32_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_int32(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_int64(simplebuffer* buffer, std::int64_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_int64(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_uint8(simplebuffer* buffer, std::uint8_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_uint8(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_uint16(simplebuffer* buffer, std::uint16_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_uint16(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_uint32(simplebuffer* buffer, std::uint32_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_uint32(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_uint64(simplebuffer* buffer, std::uint64_t value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_uint64(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_int(simplebuffer* buffer, int value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_int(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_uint(simplebuffer* buffer, unsigned int value)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_uint(bytes, value));
}

bool CPack_Simplebuffer::pack_simplebuffer_raw_header(simplebuffer* buffer, std::uint32_t length)
{
    unsigned char bytes[CPack::MAX_SCALAR_SIZE];
    return writePacked(buffer, bytes, CPack::pack_raw_header(bytes, length));
}

bool CPack_Simplebuffer::pack_simplebuffer_raw(simplebuffer* buffer, const void* data, std::uint32_t length)
{
    unsigned char header[CPack::MAX_SCALAR_SIZE];
    const unsigned long headerSize = CPack::pack_raw_header(header, length);
    unsigned char* place = CSimpleBuffer::simplebuffer_checksize(buffer, headerSize + length);
    if (place == nullptr)
        return false;
    CPack::pack_raw(place, data, length);
    return true;
}

bool CPack_Simplebuffer::pack_simplebuffer_string(simplebuffer* buffer, const std::string& text)
{
    return pack_simplebuffer_raw(buffer, text.c_str(), static_cast<std::uint32_t>(text.size() + 1));
}

bool CPack_Simplebuffer::pack_simplebuffer_wstring(simplebuffer* buffer, const std::wstring& text)
{
    return pack_simplebuffer_string(buffer, wideToMultiByte(text));
}

unsigned long CPack_Simplebuffer::pack_simplebuffer_array_header(simplebuffer*, std::uint32_t)
{
    return 0;
}

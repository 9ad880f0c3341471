#include "messaging/ptc/CUnpack.h"

#include "messaging/ptc/PackTag.h"
#include "support/LocaleText.h"

#include <bit>
#include <climits>

namespace
{

// Returns the size in bytes of the number behind a tag, or -1 for an unknown tag.
int numberSize(unsigned char tag)
{
    switch (tag) {
    case PackTag::NIL:
    case PackTag::FALSE_VALUE:
    case PackTag::TRUE_VALUE:
        return 0;
    case PackTag::UINT8:
    case PackTag::INT8:
        return 1;
    case PackTag::UINT16:
    case PackTag::INT16:
    case PackTag::RAW16:
        return 2;
    case PackTag::FLOAT:
    case PackTag::UINT32:
    case PackTag::INT32:
    case PackTag::RAW32:
        return 4;
    case PackTag::DOUBLE:
    case PackTag::UINT64:
    case PackTag::INT64:
        return 8;
    default:
        break;
    }
    const bool fix = tag <= PackTag::LAST_POSITIVE_FIX || tag >= PackTag::FIRST_NEGATIVE_FIX ||
                     (tag >= PackTag::FIRST_FIX_RAW && tag <= PackTag::LAST_FIX_RAW);
    return fix ? 0 : -1;
}

bool isRaw(unsigned char tag)
{
    return tag == PackTag::RAW16 || tag == PackTag::RAW32 ||
           (tag >= PackTag::FIRST_FIX_RAW && tag <= PackTag::LAST_FIX_RAW);
}

} // namespace

unsigned long CUnpack::unpack_base(unsigned char* p)
{
    return unpack_base(p, ULONG_MAX);
}

unsigned long CUnpack::unpack_base(unsigned char* p, unsigned long available)
{
    if (p == nullptr || available == 0)
        return 0;
    const unsigned char tag = *p;
    const int bytes = numberSize(tag);
    if (bytes < 0 || static_cast<unsigned long>(bytes) > available - 1)
        return 0;
    std::uint64_t number = 0;
    for (int i = 1; i <= bytes; ++i)
        number = number << 8 | p[i];
    const unsigned long header = 1UL + static_cast<unsigned long>(bytes);
    if (isRaw(tag)) {
        if (bytes == 0)
            number = tag & PackTag::MAX_FIX_RAW;
        if (number > available - header)
            return 0;
    }
    m_tag = tag;
    m_number = number;
    m_raw = p + header;
    return header;
}

unsigned long CUnpack::unpack(unpack_info_t* info, unsigned char* p)
{
    return unpack(info, p, ULONG_MAX);
}

unsigned long CUnpack::unpack(unpack_info_t* info, unsigned char* p, unsigned long available)
{
    CUnpack reader;
    const unsigned long header = reader.unpack_base(p, available);
    if (header == 0)
        return 0;
    reader.translate(info);
    return isRaw(reader.m_tag) ? header + reader.m_number : header;
}

void CUnpack::translate(unpack_info_t* info) const
{
    if (m_tag == PackTag::NIL) {
        info->type = UNPACK_NIL;
        return;
    }
    info->value.u64 = m_number;
    switch (m_tag) {
    case PackTag::FALSE_VALUE:
    case PackTag::TRUE_VALUE:
        info->type = UNPACK_BOOL;
        info->value.u64 = m_tag == PackTag::TRUE_VALUE ? 1 : 0;
        return;
    case PackTag::FLOAT:
        info->type = UNPACK_FLOAT;
        info->value.f = std::bit_cast<float>(static_cast<std::uint32_t>(m_number));
        return;
    case PackTag::DOUBLE:
        info->type = UNPACK_DOUBLE;
        info->value.d = std::bit_cast<double>(m_number);
        return;
    case PackTag::INT8:
        info->type = UNPACK_SIGNED;
        info->value.i64 = static_cast<std::int8_t>(m_number);
        return;
    case PackTag::INT16:
        info->type = UNPACK_SIGNED;
        info->value.i64 = static_cast<std::int16_t>(m_number);
        return;
    case PackTag::INT32:
        info->type = UNPACK_SIGNED;
        info->value.i64 = static_cast<std::int32_t>(m_number);
        return;
    case PackTag::INT64:
        info->type = UNPACK_SIGNED;
        return;
    default:
        break;
    }
    if (isRaw(m_tag)) {
        info->type = UNPACK_RAW;
        info->raw = m_raw;
    } else if (m_tag >= PackTag::FIRST_NEGATIVE_FIX) {
        info->type = UNPACK_SIGNED;
        info->value.i64 = static_cast<std::int8_t>(m_tag);
    } else {
        info->type = UNPACK_UNSIGNED;
        if (m_tag <= PackTag::LAST_POSITIVE_FIX)
            info->value.u64 = m_tag;
    }
}

std::wstring s2ws(const char* pointer, unsigned long length)
{
    return multiByteToWide(pointer, length);
}

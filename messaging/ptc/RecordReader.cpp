#include "messaging/ptc/RecordReader.h"

#include "messaging/ptc/CUnpack.h"

RecordReader::RecordReader(void* data, long size)
    : m_position(static_cast<unsigned char*>(data))
    , m_left(data != nullptr && size > 0 ? static_cast<unsigned long>(size) : 0)
{
}

int RecordReader::readInt()
{
    return static_cast<int>(next().asInteger());
}

long RecordReader::readLong()
{
    return next().asInteger();
}

bool RecordReader::readBool()
{
    return next().asInteger() != 0;
}

std::wstring RecordReader::readWide()
{
    unsigned long length = 0;
    const unsigned char* text = readRaw(&length);
    return s2ws(reinterpret_cast<const char*>(text), length);
}

unsigned char* RecordReader::readRaw(unsigned long* length)
{
    const unpack_info_t info = next();
    if (info.type != UNPACK_RAW) {
        *length = 0;
        return nullptr;
    }
    *length = info.value.u64;
    return info.raw;
}

unpack_info_t RecordReader::next()
{
    unpack_info_t info;
    const unsigned long consumed = CUnpack::unpack(&info, m_position, m_left);
    m_failed = consumed == 0;
    m_position += consumed;
    m_left -= consumed;
    return info;
}

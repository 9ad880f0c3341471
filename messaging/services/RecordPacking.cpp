#include "messaging/services/RecordPacking.h"

#include "messaging/ptc/CPack_Simplebuffer.h"

#include <algorithm>

namespace RecordPacking
{

void pack(simplebuffer* buffer, int value)
{
    WireForms::Int::pack(buffer, value);
}

void pack(simplebuffer* buffer, bool value)
{
    WireForms::Flag::pack(buffer, value);
}

void pack(simplebuffer* buffer, const std::wstring& value)
{
    WireForms::Wide::pack(buffer, value);
}

void unpack(RecordReader& reader, int& value)
{
    WireForms::Int::unpack(reader, value);
}

void unpack(RecordReader& reader, bool& value)
{
    WireForms::Flag::unpack(reader, value);
}

void unpack(RecordReader& reader, std::wstring& value)
{
    WireForms::Wide::unpack(reader, value);
}

void pack(simplebuffer* buffer, const _CALLBACK_TITLER_PARAMTER& record)
{
    const int size = record.data != nullptr ? std::max(record.size, 0) : 0;
    pack(buffer, record.type);
    pack(buffer, record.path);
    CPack_Simplebuffer::pack_simplebuffer_raw(buffer, record.data, static_cast<std::uint32_t>(size));
    pack(buffer, size);
    pack(buffer, record.count);
}

void unpack(RecordReader& reader, _CALLBACK_TITLER_PARAMTER& record)
{
    unsigned long length = 0;
    unpack(reader, record.type);
    unpack(reader, record.path);
    record.data = reader.readRaw(&length);
    record.size = std::clamp(reader.readInt(), 0, static_cast<int>(length));
    record.count = std::max(reader.readInt(), 0);
}

} // namespace RecordPacking

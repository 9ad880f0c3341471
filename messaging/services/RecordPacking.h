#pragma once

#include "messaging/ptc/CSimpleBuffer.h"
#include "messaging/ptc/RecordReader.h"
#include "messaging/ptc/WireRecord.h"
#include "messaging/services/TitlerDefine.h"

#include <string>

// Packs and reads the parameters of calls: records by their field lists, single values by their type.
namespace RecordPacking
{

struct AnyVisitor {
    template <typename Form, typename Value>
    void operator()(Form form, const char* field, Value& value) const;
};

// A record that was declared with WIRE_RECORD.
template <typename Record>
concept HasFields = requires(Record& record)
{
    Record::forEachField(record, AnyVisitor());
};

void pack(simplebuffer* buffer, int value);
void pack(simplebuffer* buffer, bool value);
void pack(simplebuffer* buffer, const std::wstring& value);
void pack(simplebuffer* buffer, const _CALLBACK_TITLER_PARAMTER& record);
template <HasFields Record>
void pack(simplebuffer* buffer, const Record& record)
{
    Record::forEachField(
        record, [buffer](auto form, const char*, const auto& value) { decltype(form)::pack(buffer, value); });
}

void unpack(RecordReader& reader, int& value);
void unpack(RecordReader& reader, bool& value);
void unpack(RecordReader& reader, std::wstring& value);
void unpack(RecordReader& reader, _CALLBACK_TITLER_PARAMTER& record);
template <HasFields Record>
void unpack(RecordReader& reader, Record& record)
{
    Record::forEachField(
        record, [&reader](auto form, const char*, auto& value) { decltype(form)::unpack(reader, value); });
}

// Returns a new buffer with the packed parameter; the caller destroys it.
template <typename Parameter>
simplebuffer serialize(const Parameter& parameter)
{
    simplebuffer buffer;
    CSimpleBuffer::simplebuffer_init(&buffer, nullptr, 0);
    pack(&buffer, parameter);
    return buffer;
}

// Reads at most size bytes. Fields that are missing or cannot be read are zero or empty.
template <typename Parameter>
void deserialize(Parameter& parameter, void* data, long size)
{
    RecordReader reader(data, size);
    unpack(reader, parameter);
}

} // namespace RecordPacking

// Declares the records of the wire. Each is declared by one list of its fields, which is also used to pack,
// read and print it.
//
// A list names a record's fields in packing order, each with its packed form and its initial value:
//     #define tagExample_FIELDS(FIELD) FIELD(Int32, clientId, -1) FIELD(Wide, path) FIELD(SevenInt, rest)
//     WIRE_RECORD(tagExample);
// declares a plain struct with the members int clientId = -1, std::wstring path and int rest[7]. Its function
// forEachField(record, visit) calls visit(form, name, member) for each field in that order.
#pragma once

#include "messaging/ptc/CPack_Simplebuffer.h"
#include "messaging/ptc/RecordReader.h"

#include <string>

// The forms in which a field can be packed. All forms of a number are read in the same way; a value that
// cannot be read is zero or empty.
namespace WireForms
{

// A number in its shortest form.
struct Int {
    using Type = int;
    static constexpr const char* KIND = "int";
    static void pack(simplebuffer* to, int value) { CPack_Simplebuffer::pack_simplebuffer_int(to, value); }
    static void unpack(RecordReader& from, int& value) { value = from.readInt(); }
};

// A number in 4 bytes and a tag.
struct Int32 {
    using Type = int;
    static constexpr const char* KIND = "int32";
    static void pack(simplebuffer* to, int value) { CPack_Simplebuffer::pack_simplebuffer_int32(to, value); }
    static void unpack(RecordReader& from, int& value) { value = from.readInt(); }
};

// An id of the framework: a long in memory, an Int32 on the wire.
struct Id {
    using Type = long;
    static constexpr const char* KIND = "int32";
    static void pack(simplebuffer* to, long value) { Int32::pack(to, static_cast<int>(value)); }
    static void unpack(RecordReader& from, long& value) { value = from.readInt(); }
};

// A number in 8 bytes and a tag.
struct Long {
    using Type = long;
    static constexpr const char* KIND = "long";
    static void pack(simplebuffer* to, long value) { CPack_Simplebuffer::pack_simplebuffer_int64(to, value); }
    static void unpack(RecordReader& from, long& value) { value = from.readLong(); }
};

struct Bool {
    using Type = bool;
    static constexpr const char* KIND = "bool";
    static void pack(simplebuffer* to, bool value) { CPack_Simplebuffer::pack_simplebuffer_bool(to, value); }
    static void unpack(RecordReader& from, bool& value) { value = from.readBool(); }
};

// A bool, packed as the number 0 or 1.
struct Flag {
    using Type = bool;
    static constexpr const char* KIND = "bool as int";
    static void pack(simplebuffer* to, bool value) { Int::pack(to, value ? 1 : 0); }
    static void unpack(RecordReader& from, bool& value) { value = from.readBool(); }
};

struct Wide {
    using Type = std::wstring;
    static constexpr const char* KIND = "wide";
    static void pack(simplebuffer* to, const Type& text)
    {
        CPack_Simplebuffer::pack_simplebuffer_wstring(to, text);
    }
    static void unpack(RecordReader& from, Type& text) { text = from.readWide(); }
};

// An array of values of one form.
template <typename Form, int COUNT>
struct Several {
    using Type = typename Form::Type[COUNT];
    static constexpr const char* KIND = Form::KIND;
    static void pack(simplebuffer* to, const Type& values)
    {
        for (const auto& value : values)
            Form::pack(to, value);
    }
    static void unpack(RecordReader& from, Type& values)
    {
        for (auto& value : values)
            Form::unpack(from, value);
    }
};
using ThreeWide = Several<Wide, 3>;
using FourWide = Several<Wide, 4>;
using SevenInt = Several<Int, 7>;

} // namespace WireForms

// clang-format off
#define WIRE_RECORD(Record) \
    struct Record { \
        static constexpr const char* NAME = #Record; \
        Record##_FIELDS(WIRE_FIELD_MEMBER) \
        template <typename AnyRecord, typename Visitor> \
        static void forEachField(AnyRecord& record, const Visitor& visit) \
        { \
            Record##_FIELDS(WIRE_FIELD_VISIT) \
        } \
    }
#define WIRE_FIELD_MEMBER(Form, field, ...) WireForms::Form::Type field{__VA_ARGS__};
#define WIRE_FIELD_VISIT(Form, field, ...) visit(WireForms::Form(), #field, record.field);
// clang-format on

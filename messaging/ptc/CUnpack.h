#pragma once

#include <cstdint>
#include <string>

enum unpack_type {
    UNPACK_NIL = 0,
    UNPACK_BOOL = 1,
    UNPACK_SIGNED = 2,
    UNPACK_UNSIGNED = 3,
    UNPACK_FLOAT = 4,
    UNPACK_DOUBLE = 5,
    UNPACK_RAW = 6,
};

struct unpack_info_t {
    int type = UNPACK_NIL;
    union {
        std::int64_t i64;
        std::uint64_t u64 = 0; // an unsigned number, 0 or 1 for a bool, or the length of raw data
        float f;
        double d;
    } value;
    unsigned char* raw = nullptr; // start of raw data, points into the message

    std::int64_t asInteger() const { return value.i64; }
};

// Reads one packed value.
class CUnpack
{
public:
    // Reads tag and number at p into this object. Returns the number of bytes read, or 0 for an unknown tag.
    // The first form trusts the message; the second reads at most available bytes and returns 0 if the value,
    // including the bytes of raw data, is incomplete.
    unsigned long unpack_base(unsigned char* p);
    unsigned long unpack_base(unsigned char* p, unsigned long available);

    // Reads one value into info and returns the number of bytes consumed. For an unknown tag, and in the
    // second form for a value longer than available, returns 0 and leaves info unchanged.
    static unsigned long unpack(unpack_info_t* info, unsigned char* p);
    static unsigned long unpack(unpack_info_t* info, unsigned char* p, unsigned long available);

private:
    void translate(unpack_info_t* info) const;

    unsigned char m_tag = 0;
    std::uint64_t m_number = 0;
    unsigned char* m_raw = nullptr;
};

// Converts length bytes of multi-byte text, up to the first NUL; see support/LocaleText.h.
std::wstring s2ws(const char* pointer, unsigned long length);

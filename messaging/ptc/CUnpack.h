// Reads one packed value.
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
        std::uint64_t u64 = 0; // unsigned numbers, 0 or 1 of a bool, the length of a raw
        float f;
        double d;
    } value;
    unsigned char* raw = nullptr; // start of a raw's bytes, inside the message

    std::int64_t asInteger() const { return value.i64; }
};

class CUnpack
{
public:
    // Reads tag and number at p into this object and returns the bytes they take, 0 for an unknown tag. The
    // first form trusts the message; the second reads at most available bytes and returns 0 when the value is
    // not all there, a raw's bytes included.
    unsigned long unpack_base(unsigned char* p);
    unsigned long unpack_base(unsigned char* p, unsigned long available);

    // Reads one value into info and returns the bytes consumed. An unknown tag, and in the second form a
    // value that goes beyond available, consumes nothing and leaves info as it was.
    static unsigned long unpack(unpack_info_t* info, unsigned char* p);
    static unsigned long unpack(unpack_info_t* info, unsigned char* p, unsigned long available);

private:
    void translate(unpack_info_t* info) const;

    unsigned char m_tag = 0;
    std::uint64_t m_number = 0;
    unsigned char* m_raw = nullptr;
};

// Wide form of the multi-byte text of length bytes at pointer, ended by the first NUL; see
// support/LocaleText.h.
std::wstring s2ws(const char* pointer, unsigned long length);

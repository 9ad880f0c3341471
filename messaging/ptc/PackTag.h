#pragma once

// The tags, which are the first bytes of packed values.
namespace PackTag
{

constexpr unsigned char LAST_POSITIVE_FIX = 0x7F;
constexpr unsigned char FIRST_FIX_RAW = 0xA0;
constexpr unsigned char LAST_FIX_RAW = 0xBF;
constexpr unsigned char MAX_FIX_RAW = 0x1F; // longest raw data of that form
constexpr unsigned char NIL = 0xC0;
constexpr unsigned char FALSE_VALUE = 0xC2;
constexpr unsigned char TRUE_VALUE = 0xC3;
constexpr unsigned char FLOAT = 0xCA;
constexpr unsigned char DOUBLE = 0xCB;
constexpr unsigned char UINT8 = 0xCC;
constexpr unsigned char UINT16 = 0xCD;
constexpr unsigned char UINT32 = 0xCE;
constexpr unsigned char UINT64 = 0xCF;
constexpr unsigned char INT8 = 0xD0;
constexpr unsigned char INT16 = 0xD1;
constexpr unsigned char INT32 = 0xD2;
constexpr unsigned char INT64 = 0xD3;
constexpr unsigned char RAW16 = 0xDA;
constexpr unsigned char RAW32 = 0xDB;
constexpr unsigned char FIRST_NEGATIVE_FIX = 0xE0;

} // namespace PackTag

// Conversion between wide strings and the process's multi-byte text.
//
// The character set is that of the environment's locale when it is UTF-8, and UTF-8 of the "C.UTF-8" locale
// otherwise: file names, archives and the wire all hold UTF-8, also in a process that was started in the "C"
// locale. The global locale is neither read nor changed. All functions are thread-safe.
#pragma once

#include <cstddef>
#include <string>

// Multi-byte form of text up to its first NUL. A character that cannot be expressed ends the result.
std::string wideToMultiByte(const std::wstring& text);

// Wide form of at most length bytes at text, ended earlier by a NUL or by an invalid sequence. Null gives an
// empty string.
std::wstring multiByteToWide(const char* text, std::size_t length);
std::wstring multiByteToWide(const std::string& text);

// Conversion between wide strings and the process's multi-byte text.
//
// The encoding is always UTF-8, from the environment's locale if that is a UTF-8 locale and from "C.UTF-8"
// otherwise, because file names, titles and messages contain UTF-8 even if the process was started in the "C"
// locale. The global locale is neither read nor changed. All functions are thread-safe.
#pragma once

#include <cstddef>
#include <string>

// Returns the multi-byte form of text up to its first NUL or the first character that cannot be converted.
std::string wideToMultiByte(const std::wstring& text);

// Returns the wide form of at most length bytes up to the first NUL or invalid sequence. Null gives an empty
// string.
std::wstring multiByteToWide(const char* text, std::size_t length);
std::wstring multiByteToWide(const std::string& text);

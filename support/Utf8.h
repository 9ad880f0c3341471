#pragma once

#include <cstddef>
#include <string>
#include <string_view>

// Checks and repairs UTF-8 from untrusted sources.
namespace Utf8
{

// Returns whether the bytes are well-formed UTF-8: no overlong forms, no surrogates, nothing above U+10FFFF.
bool isValid(std::string_view bytes);

// Returns the number of bytes of the character that begins at index, or 0 if none does. index must be less
// than the size.
std::size_t lengthAt(std::string_view bytes, std::size_t index);

// Returns the bytes with each byte that is not part of a character replaced by U+FFFD.
std::string repaired(std::string_view bytes);

} // namespace Utf8

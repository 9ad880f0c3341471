// Check of bytes that come from outside.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace Utf8
{

// Whether the bytes are well-formed UTF-8: no overlong forms, no surrogates, nothing above U+10FFFF.
bool isValid(std::string_view bytes);

// Bytes of the character that begins at index, 0 when none does. index lies within the bytes.
std::size_t lengthAt(std::string_view bytes, std::size_t index);

// The bytes with U+FFFD in the place of each that belongs to no character.
std::string repaired(std::string_view bytes);

} // namespace Utf8

// Check of bytes that come from outside.
#pragma once

#include <string_view>

namespace Utf8
{

// Whether the bytes are well-formed UTF-8: no overlong forms, no surrogates, nothing above U+10FFFF.
bool isValid(std::string_view bytes);

} // namespace Utf8

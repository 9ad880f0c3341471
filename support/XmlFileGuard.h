#pragma once

#include <cstddef>
#include <string_view>

// Checks the bytes of an XML file before TinyXML parses them.
//
// TinyXML recurses once per nested element and searches the attributes of an element linearly, so that a
// malicious or damaged file could exhaust the stack or block the program for a long time. The check limits
// both. A refused file is treated as unreadable.
class XmlFileGuard
{
public:
    static constexpr std::size_t MAX_BYTES = 8 * 1024 * 1024;
    static constexpr int MAX_DEPTH = 64;
    static constexpr int MAX_ATTRIBUTES = 256; // per element

    // Returns whether the bytes are within the limits, valid UTF-8 and free of errors that TinyXML would
    // refuse.
    static bool accepts(std::string_view bytes);
};

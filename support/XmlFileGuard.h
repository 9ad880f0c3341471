// Checks the bytes of an XML file before TinyXML sees them.
//
// TinyXML descends once per nested element and searches the attributes of an element linearly, so a hostile
// or damaged file could exhaust the stack or the patience of the operator. The check bounds both before
// TinyXML sees the file. A refused file is an unreadable file.
#pragma once

#include <cstddef>
#include <string_view>

class XmlFileGuard
{
public:
    static constexpr std::size_t MAX_BYTES = 8 * 1024 * 1024;
    static constexpr int MAX_DEPTH = 64;
    static constexpr int MAX_ATTRIBUTES = 256; // of one element

    // Whether the bytes are within the limits, valid UTF-8 and not broken in a way that TinyXML refuses
    // anyway.
    static bool accepts(std::string_view bytes);
};

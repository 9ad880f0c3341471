#include "support/XmlFileGuard.h"

#include "support/Utf8.h"

#include <charconv>
#include <cstdint>
#include <cstring>
#include <strings.h>

namespace
{

// Follows the structure of a document as TinyXML reads it. Expects the bytes up to the first NUL.
class StructureScan
{
public:
    explicit StructureScan(std::string_view bytes)
        : m_pos(bytes.data())
        , m_end(m_pos + bytes.size())
        , m_hasReferences(bytes.find("&#") != std::string_view::npos)
    {
    }

    bool run()
    {
        while (m_pos != m_end) {
            const bool isInRange = m_depth == 0 ? scanTopLevel() : scanContent();
            if (!isInRange)
                return false;
            if (m_isDone)
                return true;
        }
        return m_depth == 0;
    }

private:
    static bool isSpace(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

    static bool isNameStart(char c)
    {
        return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_' ||
               static_cast<unsigned char>(c) >= 127;
    }

    static bool isNameChar(char c)
    {
        return isNameStart(c) || (c >= '0' && c <= '9') || c == '-' || c == '.' || c == ':';
    }

    // TinyXML skips byte order marks and the non-characters U+FFFE and U+FFFF like white space.
    void skipSpace()
    {
        for (;;)
            if (m_pos != m_end && isSpace(*m_pos))
                ++m_pos;
            else if (startsWith("\xEF\xBB\xBF") || startsWith("\xEF\xBF\xBE") || startsWith("\xEF\xBF\xBF"))
                m_pos += 3;
            else
                return;
    }

    bool startsWithIgnoringCase(std::string_view lowerCaseTag) const
    {
        if (static_cast<std::size_t>(m_end - m_pos) < lowerCaseTag.size())
            return false;
        return strncasecmp(m_pos, lowerCaseTag.data(), lowerCaseTag.size()) == 0;
    }

    bool startsWith(std::string_view tag) const
    {
        return static_cast<std::size_t>(m_end - m_pos) >= tag.size() &&
               std::memcmp(m_pos, tag.data(), tag.size()) == 0;
    }

    // Moves behind the next occurrence of a byte; returns false, at the end, if there is none.
    bool skipPast(char byte)
    {
        const auto* found =
            static_cast<const char*>(std::memchr(m_pos, byte, static_cast<std::size_t>(m_end - m_pos)));
        m_pos = found ? found + 1 : m_end;
        return found;
    }

    bool skipPast(std::string_view tag)
    {
        while (m_pos != m_end && skipPast(tag.front())) {
            if (startsWith(tag.substr(1))) {
                m_pos += tag.size() - 1;
                return true;
            }
        }
        return false;
    }

    // Refuses character references without digits or without an end: TinyXML searches for the end beyond
    // quotes and tags and would see another structure than this scan.
    bool hasGoodReferences(const char* p, const char* end) const
    {
        if (!m_hasReferences)
            return true;
        while ((p = static_cast<const char*>(std::memchr(p, '&', static_cast<std::size_t>(end - p))))) {
            if (end - ++p < 1 || *p != '#')
                continue;
            const bool isHexadecimal = end - ++p > 0 && *p == 'x';
            p += isHexadecimal;
            const char* const digits = p;
            while (p != end && (isHexadecimal ? isHexadecimalDigit(*p) : *p >= '0' && *p <= '9'))
                ++p;
            if (p == digits || p == end || *p != ';' || !isCharacter({digits, p}, isHexadecimal ? 16 : 10))
                return false;
        }
        return true;
    }

    // Refuses values that are not characters, which would make the saved file unreadable, and NUL, which
    // would end a name.
    static bool isCharacter(std::string_view digits, int base)
    {
        std::uint32_t code = 0;
        const auto [end, error] = std::from_chars(digits.begin(), digits.end(), code, base);
        return error == std::errc() && code > 0 && code <= 0x10FFFF && (code < 0xD800 || code > 0xDFFF);
    }

    static bool isHexadecimalDigit(char c)
    {
        return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F');
    }

    // Outside the root element, TinyXML stops without an error at the first text.
    bool scanTopLevel()
    {
        skipSpace();
        if (m_pos == m_end)
            return true;
        if (*m_pos != '<') {
            m_isDone = true;
            return true;
        }
        return scanMarkup();
    }

    bool scanContent()
    {
        const auto* next =
            static_cast<const char*>(std::memchr(m_pos, '<', static_cast<std::size_t>(m_end - m_pos)));
        if (!next || !hasGoodReferences(m_pos, next))
            return false;
        m_pos = next;
        if (!startsWith("</"))
            return scanMarkup();
        --m_depth;
        return skipPast('>');
    }

    bool scanMarkup()
    {
        if (m_end - m_pos > 1 && isNameStart(m_pos[1])) {
            ++m_pos;
            return scanElement();
        }
        // An unterminated construct at the end of the file has no effect outside the root element.
        if (startsWithIgnoringCase("<?xml"))
            return scanDeclaration();
        if (startsWith("<!--")) {
            m_pos += 4;
            skipPast("-->");
        } else if (startsWith("<![CDATA[")) {
            m_pos += 9;
            skipPast("]]>");
        } else {
            skipPast('>');
        }
        return true;
    }

    bool scanDeclaration()
    {
        for (m_pos += 5; m_pos != m_end;) {
            skipSpace();
            if (m_pos == m_end)
                break;
            if (*m_pos == '>') {
                ++m_pos;
                break;
            }
            if (startsWithIgnoringCase("version") || startsWithIgnoringCase("encoding") ||
                startsWithIgnoringCase("standalone")) {
                if (!scanAttribute()) { // TinyXML stops here, which is an error only inside the root element
                    m_isDone = true;
                    return m_depth == 0;
                }
            } else {
                while (m_pos != m_end && *m_pos != '>' && !isSpace(*m_pos))
                    ++m_pos;
            }
        }
        return true;
    }

    bool scanElement()
    {
        if (m_depth + 1 > XmlFileGuard::MAX_DEPTH)
            return false;
        while (m_pos != m_end && isNameChar(*m_pos))
            ++m_pos;
        for (int attributes = 0;; ++attributes) {
            skipSpace();
            if (m_pos == m_end)
                return false;
            if (*m_pos == '>') {
                ++m_pos;
                ++m_depth;
                return true;
            }
            if (*m_pos == '/') {
                ++m_pos;
                return m_pos != m_end && *m_pos++ == '>';
            }
            if (attributes == XmlFileGuard::MAX_ATTRIBUTES || !scanAttribute())
                return false;
        }
    }

    bool scanAttribute()
    {
        if (!isNameStart(*m_pos))
            return false;
        while (m_pos != m_end && isNameChar(*m_pos))
            ++m_pos;
        skipSpace();
        if (m_pos == m_end || *m_pos != '=')
            return false;
        ++m_pos;
        skipSpace();
        if (m_pos == m_end)
            return false;
        if (*m_pos == '"' || *m_pos == '\'') {
            const char quote = *m_pos++;
            const char* const value = m_pos;
            return skipPast(quote) && hasGoodReferences(value, m_pos - 1);
        }
        while (m_pos != m_end && !isSpace(*m_pos) && *m_pos != '/' && *m_pos != '>') {
            if (*m_pos == '"' || *m_pos == '\'')
                return false;
            ++m_pos;
        }
        return true;
    }

    const char* m_pos;
    const char* m_end;
    bool m_hasReferences;
    int m_depth = 0;
    bool m_isDone = false;
};

} // namespace

bool XmlFileGuard::accepts(std::string_view bytes)
{
    if (bytes.empty() || bytes.size() > MAX_BYTES)
        return false;
    bytes = bytes.substr(0, bytes.find('\0'));
    return Utf8::isValid(bytes) && StructureScan(bytes).run();
}

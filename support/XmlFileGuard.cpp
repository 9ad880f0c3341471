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
        : mPos(bytes.data())
        , mEnd(mPos + bytes.size())
        , mHasReferences(bytes.find("&#") != std::string_view::npos)
    {
    }

    bool run()
    {
        while (mPos != mEnd) {
            const bool isInRange = mDepth == 0 ? scanTopLevel() : scanContent();
            if (!isInRange)
                return false;
            if (mIsDone)
                return true;
        }
        return mDepth == 0;
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
            if (mPos != mEnd && isSpace(*mPos))
                ++mPos;
            else if (startsWith("\xEF\xBB\xBF") || startsWith("\xEF\xBF\xBE") || startsWith("\xEF\xBF\xBF"))
                mPos += 3;
            else
                return;
    }

    bool startsWithIgnoringCase(std::string_view lowerCaseTag) const
    {
        if (static_cast<std::size_t>(mEnd - mPos) < lowerCaseTag.size())
            return false;
        return strncasecmp(mPos, lowerCaseTag.data(), lowerCaseTag.size()) == 0;
    }

    bool startsWith(std::string_view tag) const
    {
        return static_cast<std::size_t>(mEnd - mPos) >= tag.size() &&
               std::memcmp(mPos, tag.data(), tag.size()) == 0;
    }

    // Moves behind the next occurrence of a byte; returns false, at the end, if there is none.
    bool skipPast(char byte)
    {
        const auto* found =
            static_cast<const char*>(std::memchr(mPos, byte, static_cast<std::size_t>(mEnd - mPos)));
        mPos = found ? found + 1 : mEnd;
        return found;
    }

    bool skipPast(std::string_view tag)
    {
        while (mPos != mEnd && skipPast(tag.front())) {
            if (startsWith(tag.substr(1))) {
                mPos += tag.size() - 1;
                return true;
            }
        }
        return false;
    }

    // Refuses character references without digits or without an end: TinyXML searches for the end beyond
    // quotes and tags and would see another structure than this scan.
    bool hasGoodReferences(const char* p, const char* end) const
    {
        if (!mHasReferences)
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
        if (mPos == mEnd)
            return true;
        if (*mPos != '<') {
            mIsDone = true;
            return true;
        }
        return scanMarkup();
    }

    bool scanContent()
    {
        const auto* next =
            static_cast<const char*>(std::memchr(mPos, '<', static_cast<std::size_t>(mEnd - mPos)));
        if (!next || !hasGoodReferences(mPos, next))
            return false;
        mPos = next;
        if (!startsWith("</"))
            return scanMarkup();
        --mDepth;
        return skipPast('>');
    }

    bool scanMarkup()
    {
        if (mEnd - mPos > 1 && isNameStart(mPos[1])) {
            ++mPos;
            return scanElement();
        }
        // An unterminated construct at the end of the file has no effect outside the root element.
        if (startsWithIgnoringCase("<?xml"))
            return scanDeclaration();
        if (startsWith("<!--")) {
            mPos += 4;
            skipPast("-->");
        } else if (startsWith("<![CDATA[")) {
            mPos += 9;
            skipPast("]]>");
        } else {
            skipPast('>');
        }
        return true;
    }

    bool scanDeclaration()
    {
        for (mPos += 5; mPos != mEnd;) {
            skipSpace();
            if (mPos == mEnd)
                break;
            if (*mPos == '>') {
                ++mPos;
                break;
            }
            if (startsWithIgnoringCase("version") || startsWithIgnoringCase("encoding") ||
                startsWithIgnoringCase("standalone")) {
                if (!scanAttribute()) { // TinyXML stops here, which is an error only inside the root element
                    mIsDone = true;
                    return mDepth == 0;
                }
            } else {
                while (mPos != mEnd && *mPos != '>' && !isSpace(*mPos))
                    ++mPos;
            }
        }
        return true;
    }

    bool scanElement()
    {
        if (mDepth + 1 > XmlFileGuard::MAX_DEPTH)
            return false;
        while (mPos != mEnd && isNameChar(*mPos))
            ++mPos;
        for (int attributes = 0;; ++attributes) {
            skipSpace();
            if (mPos == mEnd)
                return false;
            if (*mPos == '>') {
                ++mPos;
                ++mDepth;
                return true;
            }
            if (*mPos == '/') {
                ++mPos;
                return mPos != mEnd && *mPos++ == '>';
            }
            if (attributes == XmlFileGuard::MAX_ATTRIBUTES || !scanAttribute())
                return false;
        }
    }

    bool scanAttribute()
    {
        if (!isNameStart(*mPos))
            return false;
        while (mPos != mEnd && isNameChar(*mPos))
            ++mPos;
        skipSpace();
        if (mPos == mEnd || *mPos != '=')
            return false;
        ++mPos;
        skipSpace();
        if (mPos == mEnd)
            return false;
        if (*mPos == '"' || *mPos == '\'') {
            const char quote = *mPos++;
            const char* const value = mPos;
            return skipPast(quote) && hasGoodReferences(value, mPos - 1);
        }
        while (mPos != mEnd && !isSpace(*mPos) && *mPos != '/' && *mPos != '>') {
            if (*mPos == '"' || *mPos == '\'')
                return false;
            ++mPos;
        }
        return true;
    }

    const char* mPos;
    const char* mEnd;
    bool mHasReferences;
    int mDepth = 0;
    bool mIsDone = false;
};

} // namespace

bool XmlFileGuard::accepts(std::string_view bytes)
{
    if (bytes.empty() || bytes.size() > MAX_BYTES)
        return false;
    bytes = bytes.substr(0, bytes.find('\0'));
    return Utf8::isValid(bytes) && StructureScan(bytes).run();
}

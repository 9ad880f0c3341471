#include "support/XmlFile.h"

#include "support/AtomicFile.h"
#include "support/RefusedWrites.h"
#include "support/Utf8.h"
#include "support/XmlFileGuard.h"

#include <cstdio>
#include <cstdlib>
#include <string_view>
#include <tinyxml.h>

namespace
{

constexpr std::string_view BYTE_ORDER_MARK = "\xEF\xBB\xBF";

// TinyXML writes a byte order mark that it has read, but has no getter for it. The address of this variable
// as user data marks such a document.
char gMarked;

// Replaces all line ends by single line feeds.
void normaliseLineEnds(std::string& bytes)
{
    std::size_t from = bytes.find('\r');
    if (from == std::string::npos)
        return;
    std::size_t to = from;
    for (; from < bytes.size(); ++from) {
        if (bytes[from] == '\r') {
            bytes[to++] = '\n';
            if (from + 1 < bytes.size() && bytes[from + 1] == '\n')
                ++from;
        } else {
            bytes[to++] = bytes[from];
        }
    }
    bytes.resize(to);
}

// Writes a document as TinyXML prints it. Elements and attributes are written here, which avoids TinyXML's
// formatted output for every attribute; other nodes are rare and print themselves.
class Printer
{
public:
    std::string take() { return std::move(m_bytes); }

    void print(const TiXmlDocument& document)
    {
        if (document.GetUserData() == &gMarked)
            m_bytes += BYTE_ORDER_MARK;
        for (const TiXmlNode* node = document.FirstChild(); node; node = node->NextSibling()) {
            print(*node, 0);
            m_bytes += '\n';
        }
    }

private:
    void print(const TiXmlNode& node, int depth)
    {
        if (const TiXmlElement* element = node.ToElement()) {
            printElement(*element, depth);
            return;
        }
        char* text = nullptr;
        std::size_t size = 0;
        if (std::FILE* const stream = ::open_memstream(&text, &size)) {
            node.Print(stream, depth);
            std::fclose(stream);
            m_bytes.append(text, size);
            std::free(text);
        }
    }

    void printElement(const TiXmlElement& element, int depth)
    {
        indent(depth);
        m_bytes += '<';
        m_bytes += element.ValueStr();
        for (const TiXmlAttribute* attribute = element.FirstAttribute(); attribute;
             attribute = attribute->Next()) {
            m_bytes += ' ';
            printAttribute(*attribute);
        }
        const TiXmlNode* const first = element.FirstChild();
        if (!first) {
            m_bytes += " />";
            return;
        }
        m_bytes += '>';
        if (first == element.LastChild() && first->ToText()) {
            print(*first, depth + 1);
        } else {
            for (const TiXmlNode* node = first; node; node = node->NextSibling()) {
                if (!node->ToText())
                    m_bytes += '\n';
                print(*node, depth + 1);
            }
            m_bytes += '\n';
            indent(depth);
        }
        m_bytes += "</";
        m_bytes += element.ValueStr();
        m_bytes += '>';
    }

    void printAttribute(const TiXmlAttribute& attribute)
    {
        const std::string& value = attribute.ValueStr();
        const char quote = value.find('"') == std::string::npos ? '"' : '\'';
        append(attribute.NameTStr());
        m_bytes += '=';
        m_bytes += quote;
        append(value);
        m_bytes += quote;
    }

    // As TiXmlBase::EncodeString, except for "&#x" in a text: TinyXML writes that unescaped, and no reader
    // could read it back.
    void append(const std::string& text)
    {
        static constexpr char DIGITS[] = "0123456789ABCDEF";
        std::size_t done = 0;
        for (std::size_t i = 0; i < text.size(); ++i) {
            const auto c = static_cast<unsigned char>(text[i]);
            if (!isReserved(c))
                continue;
            m_bytes.append(text, done, i - done);
            done = i + 1;
            switch (c) {
            case '&':
                m_bytes += "&amp;";
                break;
            case '<':
                m_bytes += "&lt;";
                break;
            case '>':
                m_bytes += "&gt;";
                break;
            case '"':
                m_bytes += "&quot;";
                break;
            case '\'':
                m_bytes += "&apos;";
                break;
            default:
                m_bytes += "&#x";
                m_bytes += DIGITS[c >> 4];
                m_bytes += DIGITS[c & 15];
                m_bytes += ';';
            }
        }
        m_bytes.append(text, done);
    }

    static bool isReserved(unsigned char c)
    {
        return c < 32 || c == '&' || c == '<' || c == '>' || c == '"' || c == '\'';
    }

    void indent(int depth) { m_bytes.append(static_cast<std::size_t>(depth) * 4, ' '); }

    std::string m_bytes;
};

} // namespace

bool XmlFile::load(const std::string& path, TiXmlDocument& document)
{
    std::string bytes;
    if (!RefusedWrites::find(path, bytes) && !AtomicFile::read(path, XmlFileGuard::MAX_BYTES, bytes))
        return false;
    if (!XmlFileGuard::accepts(bytes))
        return false;
    normaliseLineEnds(bytes);
    document.Clear();
    document.ClearError();
    document.SetUserData(bytes.starts_with(BYTE_ORDER_MARK) ? &gMarked : nullptr);
    document.SetValue(path);
    document.SetTabSize(0); // not needed here: line and column of elements
    // The bytes are UTF-8 whatever the declaration says. As another encoding TinyXML would make one byte of
    // each character reference, a NUL of some.
    document.Parse(bytes.c_str(), nullptr, TIXML_ENCODING_UTF8);
    return !document.Error();
}

bool XmlFile::save(const TiXmlDocument& document, const std::string& path)
{
    return AtomicFile::write(path, toBytes(document));
}

std::string XmlFile::toBytes(const TiXmlDocument& document)
{
    Printer printer;
    printer.print(document);
    std::string bytes = printer.take();
    // Invalid UTF-8 would make the file unreadable.
    if (!Utf8::isValid(bytes))
        bytes = Utf8::repaired(bytes);
    return bytes;
}

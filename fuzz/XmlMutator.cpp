// Mutates XML: elements are duplicated, removed, moved and nested, attributes are exchanged and set to values
// that are often handled wrongly. Input that is not XML is mutated byte by byte.
#include <algorithm>
#include <cstdint>
#include <cstring>
#include <memory>
#include <random>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

extern "C" std::size_t LLVMFuzzerMutate(std::uint8_t* data, std::size_t size, std::size_t maximum);

namespace
{

struct Element {
    std::string name;
    std::vector<std::pair<std::string, std::string>> attributes;
    std::vector<std::unique_ptr<Element>> children;
    std::string text;
};
using ElementPointer = std::unique_ptr<Element>;

constexpr int DEEPEST = 80; // slightly deeper than the program accepts

// Reads only what the files of the program contain: elements, attributes, text.
class Reader
{
public:
    explicit Reader(std::string_view text) : m_rest(text) {}

    ElementPointer read()
    {
        while (skipTo('<'))
            if (m_rest.size() > 1 && (m_rest[1] == '?' || m_rest[1] == '!'))
                m_rest.remove_prefix(1);
            else
                return element(0);
        return nullptr;
    }

private:
    bool skipTo(char sign)
    {
        const std::size_t at = m_rest.find(sign);
        m_rest.remove_prefix(std::min(at, m_rest.size()));
        return !m_rest.empty();
    }
    void skipBlanks()
    {
        while (!m_rest.empty() && std::strchr(" \t\r\n", m_rest.front()))
            m_rest.remove_prefix(1);
    }
    std::string word()
    {
        const std::size_t end = std::min(m_rest.find_first_of(" \t\r\n=/><"), m_rest.size());
        std::string result(m_rest.substr(0, end));
        m_rest.remove_prefix(end);
        return result;
    }
    bool take(std::string_view token)
    {
        if (!m_rest.starts_with(token))
            return false;
        m_rest.remove_prefix(token.size());
        return true;
    }
    bool attribute(Element& owner)
    {
        const std::string key = word();
        skipBlanks();
        if (key.empty() || !take("="))
            return false;
        skipBlanks();
        if (m_rest.empty() || (m_rest.front() != '"' && m_rest.front() != '\''))
            return false;
        const std::size_t end = m_rest.find(m_rest.front(), 1);
        if (end == std::string_view::npos)
            return false;
        owner.attributes.emplace_back(key, m_rest.substr(1, end - 1));
        m_rest.remove_prefix(end + 1);
        return true;
    }
    ElementPointer element(int depth)
    {
        if (depth > DEEPEST || !take("<"))
            return nullptr;
        auto result = std::make_unique<Element>();
        result->name = word();
        if (result->name.empty())
            return nullptr;
        for (;;) {
            skipBlanks();
            if (take("/>"))
                return result;
            if (take(">"))
                return content(std::move(result), depth);
            if (!attribute(*result))
                return nullptr;
        }
    }
    ElementPointer content(ElementPointer owner, int depth)
    {
        for (;;) {
            const std::size_t end = std::min(m_rest.find('<'), m_rest.size());
            owner->text += m_rest.substr(0, end);
            m_rest.remove_prefix(end);
            if (m_rest.empty())
                return nullptr;
            if (take("</")) {
                skipTo('>');
                take(">");
                return owner;
            }
            ElementPointer child = element(depth + 1);
            if (!child)
                return nullptr;
            owner->children.push_back(std::move(child));
        }
    }

    std::string_view m_rest;
};

void print(const Element& element, std::string& text)
{
    text += '<' + element.name;
    for (const auto& [key, value] : element.attributes)
        text += ' ' + key + "=\"" + value + '"';
    if (element.children.empty() && element.text.empty()) {
        text += "/>";
        return;
    }
    text += '>' + element.text;
    for (const ElementPointer& child : element.children)
        print(*child, text);
    text += "</" + element.name + '>';
}

ElementPointer copyOf(const Element& element)
{
    auto copy = std::make_unique<Element>();
    copy->name = element.name;
    copy->attributes = element.attributes;
    copy->text = element.text;
    for (const ElementPointer& child : element.children)
        copy->children.push_back(copyOf(*child));
    return copy;
}

void collect(Element& element, std::vector<Element*>& all)
{
    all.push_back(&element);
    for (const ElementPointer& child : element.children)
        collect(*child, all);
}

const char* const VALUES[] = {"",
                              " ",
                              "0",
                              "-0",
                              "1",
                              "-1",
                              "4",
                              "5",
                              "10",
                              "11",
                              "19",
                              "20",
                              "999",
                              "1000",
                              "65536",
                              "2147483647",
                              "-2147483648",
                              "2147483648",
                              "9223372036854775808",
                              "1e9",
                              "1e39",
                              "-1e39",
                              "1e-46",
                              "nan",
                              "inf",
                              "0x10",
                              "1.5",
                              "1,5",
                              ".5",
                              "+3",
                              "true",
                              "false",
                              "#ffffff",
                              "#FFFFFFFF",
                              "#12",
                              "red",
                              "&lt;&amp;&quot;&apos;&gt;",
                              "&#0;",
                              "&#x1F600;",
                              "&#xD800;",
                              "&#1;",
                              "&#10;",
                              "&#13;",
                              "&#xA0;",
                              "&#x110000;",
                              "&nbsp;",
                              "&",
                              "a\tb",
                              "a\nb",
                              "a\r\nb",
                              "\xef\xbb\xbf",
                              "\xf0\x9f\x98\x80",
                              "\xe5\xbf\xab\xe8\xae\xaf",
                              "e\xcc\x81",
                              "\xc0\x80",
                              "\xed\xa0\x80",
                              "\xff",
                              "../../a.xml",
                              "/etc/passwd",
                              ".",
                              "..",
                              "a/b",
                              "a.xml",
                              ".xml",
                              "xml",
                              ".order.xml",
                              "/",
                              "UserTemplate_001/Titler",
                              "UserTemplate_999",
                              "UserTemplate_9999999999",
                              "UserTemplate_-01",
                              "%s%n",
                              "a_1920.png",
                              "align-left",
                              "center",
                              "right",
                              "Nimbus Sans L"};

class Mutation
{
public:
    Mutation(Element& root, unsigned seed) : m_random(seed) { collect(root, m_all); }

    void run()
    {
        switch (below(9)) {
        case 0:
            return duplicate();
        case 1:
            return remove();
        case 2:
            return moveOrNest();
        case 3:
            return graft();
        case 4:
            return exchangeAttributes();
        case 5:
            return editAttributes();
        case 6:
            any().text = VALUES[below(std::size(VALUES))];
            return;
        default:
            return setValue();
        }
    }

private:
    std::size_t below(std::size_t bound) { return bound == 0 ? 0 : m_random() % bound; }
    Element& any() { return *m_all[below(m_all.size())]; }

    void duplicate()
    {
        Element& parent = any();
        if (parent.children.empty())
            return;
        const std::size_t from = below(parent.children.size());
        // One time in eight adds a hundred copies, to reach the limits.
        const std::size_t times = below(8) == 0 ? 100 : 1;
        for (std::size_t i = 0; i < times; ++i)
            parent.children.push_back(copyOf(*parent.children[from]));
    }
    void remove()
    {
        Element& parent = any();
        if (!parent.children.empty())
            parent.children.erase(parent.children.begin() + std::ptrdiff_t(below(parent.children.size())));
    }
    void moveOrNest()
    {
        Element& parent = any();
        if (parent.children.size() > 1 && below(2) == 0) {
            std::swap(parent.children.front(), parent.children[below(parent.children.size())]);
            return;
        }
        const std::size_t levels = below(6) == 0 ? 70 : 1;
        for (std::size_t i = 0; i < levels; ++i) {
            auto inner = std::make_unique<Element>();
            inner->name = parent.name;
            inner->attributes = parent.attributes;
            inner->children.swap(parent.children);
            parent.children.push_back(std::move(inner));
        }
    }
    void graft() { any().children.push_back(copyOf(any())); }
    void exchangeAttributes()
    {
        Element& a = any();
        Element& b = any();
        if (a.attributes.empty() || b.attributes.empty())
            return;
        std::swap(a.attributes[below(a.attributes.size())].second,
                  b.attributes[below(b.attributes.size())].second);
    }
    void editAttributes()
    {
        Element& element = any();
        if (element.attributes.empty())
            return;
        const std::size_t at = below(element.attributes.size());
        if (below(3) == 0)
            element.attributes.erase(element.attributes.begin() + std::ptrdiff_t(at));
        else if (below(2) == 0)
            element.attributes.push_back(element.attributes[at]); // an attribute given twice is not XML
        else
            element.attributes[at].first += 'x';
    }
    void setValue()
    {
        Element& element = any();
        if (element.attributes.empty())
            return;
        std::string& value = element.attributes[below(element.attributes.size())].second;
        if (below(4) == 0)
            value += value; // doubles the text, to get long ones
        else if (below(3) == 0)
            value += VALUES[below(std::size(VALUES))];
        else
            value = VALUES[below(std::size(VALUES))];
    }

    std::mt19937 m_random;
    std::vector<Element*> m_all;
};

} // namespace

extern "C" std::size_t LLVMFuzzerCustomMutator(std::uint8_t* data, std::size_t size, std::size_t maximum,
                                               unsigned seed)
{
    if (seed % 5 == 0)
        return LLVMFuzzerMutate(data, size, maximum);
    const ElementPointer root = Reader({reinterpret_cast<const char*>(data), size}).read();
    if (!root)
        return LLVMFuzzerMutate(data, size, maximum);
    for (unsigned i = 0; i <= seed % 3; ++i)
        Mutation(*root, seed + i).run();
    std::string text = "<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n";
    print(*root, text);
    if (text.size() > maximum)
        return LLVMFuzzerMutate(data, size, maximum);
    std::memcpy(data, text.data(), text.size());
    return text.size();
}

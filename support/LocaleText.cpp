#include "support/LocaleText.h"

#include <langinfo.h>
#include <locale.h>

#include <cstring>
#include <cwchar>

namespace
{

locale_t openTextLocale()
{
    locale_t fromEnvironment = newlocale(LC_CTYPE_MASK, "", nullptr);
    if (fromEnvironment != nullptr) {
        if (std::strcmp(nl_langinfo_l(CODESET, fromEnvironment), "UTF-8") == 0)
            return fromEnvironment;
        freelocale(fromEnvironment);
    }
    return newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr);
}

// Sets the text locale for the calling thread during the lifetime of the object.
class TextLocaleScope
{
public:
    TextLocaleScope()
    {
        static const locale_t locale = openTextLocale();
        m_previous = uselocale(locale);
    }
    ~TextLocaleScope() { uselocale(m_previous); }
    TextLocaleScope(const TextLocaleScope&) = delete;
    TextLocaleScope& operator=(const TextLocaleScope&) = delete;

private:
    locale_t m_previous = nullptr;
};

} // namespace

std::string wideToMultiByte(const std::wstring& text)
{
    const TextLocaleScope scope;
    std::string result;
    result.reserve(text.size());
    std::mbstate_t state{};
    char bytes[16];
    for (const wchar_t character : text) {
        if (character == L'\0')
            break;
        const std::size_t count = std::wcrtomb(bytes, character, &state);
        if (count == static_cast<std::size_t>(-1))
            break;
        result.append(bytes, count);
    }
    return result;
}

std::wstring multiByteToWide(const char* text, std::size_t length)
{
    std::wstring result;
    if (text == nullptr)
        return result;
    const TextLocaleScope scope;
    std::mbstate_t state{};
    while (length > 0) {
        wchar_t character = L'\0';
        const std::size_t count = std::mbrtowc(&character, text, length, &state);
        if (count == 0 || count > length) // a NUL, an invalid or an incomplete sequence
            break;
        result.push_back(character);
        text += count;
        length -= count;
    }
    return result;
}

std::wstring multiByteToWide(const std::string& text)
{
    return multiByteToWide(text.data(), text.size());
}

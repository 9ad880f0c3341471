#include "document/TitleParserUtility.h"

#include "support/LocaleText.h"

#include <algorithm>
#include <charconv>
#include <clocale>
#include <cmath>
#include <cstdlib>
#include <dirent.h>
#include <limits>
#include <sys/stat.h>
#include <tinyxml.h>

namespace
{

const std::string* findAttribute(const TiXmlElement* element, const std::string& key)
{
    return element ? element->Attribute(key) : nullptr;
}

locale_t numberLocale()
{
    static const locale_t locale = ::newlocale(LC_ALL_MASK, "C", nullptr);
    return locale;
}

// Returns whether the entry is a folder. Some file systems do not store the type in the directory entry.
bool isFolder(const std::string& folder, const dirent& entry)
{
    if (entry.d_type != DT_UNKNOWN)
        return entry.d_type == DT_DIR;
    struct stat status = {};
    return ::lstat((folder + '/' + entry.d_name).c_str(), &status) == 0 && S_ISDIR(status.st_mode);
}

template <typename Accept>
std::vector<std::string> queryFolder(const std::string& folder, Accept accept)
{
    std::vector<std::string> paths;
    DIR* const directory = ::opendir(folder.c_str());
    if (!directory)
        return paths;
    while (const dirent* entry = ::readdir(directory))
        if (accept(*entry))
            paths.push_back(folder + '/' + entry->d_name);
    ::closedir(directory);
    return paths;
}

} // namespace

std::string TitleParserUtility::getAttribute(const TiXmlElement* element, const std::string& key)
{
    const std::string* value = findAttribute(element, key);
    return value ? *value : std::string();
}

int TitleParserUtility::getIntAttribute(const TiXmlElement* element, const std::string& key)
{
    const std::string* value = findAttribute(element, key);
    return value ? toInt(*value) : 0;
}

double TitleParserUtility::getDoubleAttribute(const TiXmlElement* element, const std::string& key)
{
    const std::string* value = findAttribute(element, key);
    return value ? toDouble(*value) : 0.0;
}

int TitleParserUtility::toInt(const std::string& text)
{
    int value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error == std::errc())
        return value;
    // leading blanks, a plus sign, or a number outside the range of int
    return static_cast<int>(std::strtol(text.c_str(), nullptr, 10));
}

double TitleParserUtility::toDouble(const std::string& text)
{
    return ::strtod_l(text.c_str(), nullptr, numberLocale());
}

int TitleParserUtility::truncated(double value)
{
    if (std::isnan(value))
        return 0;
    constexpr double LOWEST = std::numeric_limits<int>::min();
    constexpr double HIGHEST = std::numeric_limits<int>::max();
    return static_cast<int>(std::clamp(value, LOWEST, HIGHEST));
}

std::string TitleParserUtility::fromDouble(double value)
{
    char buffer[32];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::general, 6);
    return std::string(buffer, result.ptr);
}

std::wstring TitleParserUtility::string2Wstring(const std::string& text)
{
    return multiByteToWide(text);
}

std::string TitleParserUtility::wstring2String(const std::wstring& text)
{
    return wideToMultiByte(text);
}

std::string TitleParserUtility::char2String(unsigned char byte)
{
    static constexpr char DIGITS[] = "0123456789ABCDEF";
    return {DIGITS[byte >> 4], DIGITS[byte & 15]};
}

std::vector<std::string> TitleParserUtility::queryChildFolders(const std::string& folder)
{
    return queryFolder(
        folder, [&](const dirent& entry) { return entry.d_name[0] != '.' && isFolder(folder, entry); });
}

std::vector<std::string> TitleParserUtility::queryFilesInFolder(const std::string& folder)
{
    return queryFolder(folder, [&](const dirent& entry) {
        return std::string_view(entry.d_name).find(".xml") != std::string_view::npos &&
               !isFolder(folder, entry);
    });
}

// What the readers of title files share: attribute access, wide strings, directory listings. Any thread.
#pragma once

#include <string>
#include <vector>

class TiXmlElement;

class TitleParserUtility
{
public:
    // Empty, 0 or 0.0 when the element or the attribute is missing or is no number. Numbers have a point in
    // every locale.
    static std::string getAttribute(const TiXmlElement* element, const std::string& key);
    static int getIntAttribute(const TiXmlElement* element, const std::string& key);
    static double getDoubleAttribute(const TiXmlElement* element, const std::string& key);

    // The number that a text begins with, after blanks; 0 when it begins with none.
    static int toInt(const std::string& text);
    static double toDouble(const std::string& text);

    // The number without its fraction; the nearest int when it is out of range, 0 when it is no number.
    static int truncated(double value);

    // Shortest text with at most six significant digits, as the attributes have it.
    static std::string fromDouble(double value);

    static std::wstring string2Wstring(const std::string& text);
    static std::string wstring2String(const std::wstring& text);

    // Two upper-case hexadecimal digits.
    static std::string char2String(unsigned char byte);

    // Full paths of the sub-folders whose names do not begin with ".", in the directory's order.
    static std::vector<std::string> queryChildFolders(const std::string& folder);

    // Full paths of the files whose names contain ".xml" anywhere, in the directory's order.
    static std::vector<std::string> queryFilesInFolder(const std::string& folder);
};

#pragma once

#include <string>
#include <vector>

class TiXmlElement;

// Functions shared by the readers of title files: attribute access, wide strings, directory listings. Any
// thread.
class TitleParserUtility
{
public:
    // Return an empty string, 0 or 0.0 if the element or the attribute is missing or not a number. Numbers
    // have a decimal point in every locale.
    static std::string getAttribute(const TiXmlElement* element, const std::string& key);
    static int getIntAttribute(const TiXmlElement* element, const std::string& key);
    static double getDoubleAttribute(const TiXmlElement* element, const std::string& key);

    // Return the number at the beginning of a text, after blanks, or 0 if there is none.
    static int toInt(const std::string& text);
    static double toDouble(const std::string& text);

    // Returns the number without its fraction, limited to the range of int; 0 for NaN.
    static int truncated(double value);

    // Returns the shortest text with at most six significant digits, as used in the attributes.
    static std::string fromDouble(double value);

    static std::wstring string2Wstring(const std::string& text);
    static std::string wstring2String(const std::wstring& text);

    // Returns two upper-case hexadecimal digits.
    static std::string char2String(unsigned char byte);

    // Returns the full paths of the sub-folders whose names do not begin with ".", in the directory's order.
    static std::vector<std::string> queryChildFolders(const std::string& folder);

    // Returns the full paths of the files whose names contain ".xml" anywhere, in the directory's order.
    static std::vector<std::string> queryFilesInFolder(const std::string& folder);
};

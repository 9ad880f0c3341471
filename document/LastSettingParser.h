#pragma once

#include <string>

class TiXmlDocument;

// Stores the remembered paths in a small file with one element for each path. Constructed where it is needed;
// caches nothing. GUI thread.
class LastSettingParser
{
public:
    static constexpr char TEMP_FILENAME[] = "/TitlerLastPathSetting.xml";
    static constexpr char TEMP_ROOT[] = "manifest";
    static constexpr char TEMP_TYPE[] = "type";
    static constexpr char TEMP_TYPE_VAL[] = "last-setting";

    // If folder is empty, the system settings folder is used; if that is unknown, nothing is read or written.
    explicit LastSettingParser(std::string folder);

    // Writes a new file with that one element. Returns whether it was saved.
    bool createTempFile(const std::string& element, const std::string& attribute, const std::string& value);

    // Changes or adds the element and keeps the others; replaces a file that cannot be read. Returns whether
    // it was saved.
    bool editTempFile(const std::string& element, const std::string& attribute, const std::string& value);

    // Returns an empty string if the file, the element or the attribute is missing.
    std::string getTempAttribute(const std::string& element, const std::string& attribute);

private:
    bool save(const TiXmlDocument& document);

    std::string m_filePath;
};

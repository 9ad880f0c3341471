// The remembered paths: a small file with one element for each path. Made where it is needed; nothing is
// cached. GUI thread.
#pragma once

#include <string>

class TiXmlDocument;

class LastSettingParser
{
public:
    static constexpr char TEMP_FILENAME[] = "/TitlerLastPathSetting.xml";
    static constexpr char TEMP_ROOT[] = "manifest";
    static constexpr char TEMP_TYPE[] = "type";
    static constexpr char TEMP_TYPE_VAL[] = "last-setting";

    // An empty folder stands for the system settings folder; without one of these, nothing is read or
    // written.
    explicit LastSettingParser(std::string folder);

    // Writes a new file with that one element. Whether it was saved.
    bool createTempFile(const std::string& element, const std::string& attribute, const std::string& value);

    // Changes or adds the element and keeps the others; a file that cannot be read is replaced by a new one.
    // Whether it was saved.
    bool editTempFile(const std::string& element, const std::string& attribute, const std::string& value);

    // Empty when the file, the element or the attribute is missing.
    std::string getTempAttribute(const std::string& element, const std::string& attribute);

private:
    bool save(const TiXmlDocument& document);

    std::string mFilePath;
};

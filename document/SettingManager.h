#pragma once

#include <string>

class FontStyle;
class TiXmlElement;

// Stores the remembered text style. Constructed where it is needed; every call reads or writes the file. GUI
// thread.
class SettingManager
{
public:
    static constexpr char SETTING_FILENAME[] = "/TitlerFontPropertySetting.xml";
    static constexpr char SETTING_ROOT[] = "manifest";
    static constexpr char SETTING_TYPE[] = "type";
    static constexpr char SETTING_TYPE_VAL[] = "setting";
    static constexpr char SETTING_FONT_STYLE[] = "font-style";
    static constexpr char SETTING_FONT_FAMILY[] = "family";
    static constexpr char SETTING_FONT_SIZE[] = "size";
    static constexpr char SETTING_FONT_COLOR[] = "color";
    static constexpr char SETTING_FONT_BOLD[] = "bold";
    static constexpr char SETTING_FONT_ITALIC[] = "italic";
    static constexpr char SETTING_FONT_KERNING[] = "kerning";
    static constexpr char SETTING_FONT_ALIGN[] = "align";
    static constexpr char SETTING_FONT_SHADOW[] = "shadow";
    static constexpr char SETTING_FONT_SHADOW_COLOR[] = "shadow-color";
    static constexpr char SETTING_FONT_SHADOW_DIRECTION_X[] = "shadow-direction-x";
    static constexpr char SETTING_FONT_SHADOW_DIRECTION_Y[] = "shadow-direction-y";
    static constexpr char SETTING_FONT_SHADOW_BLUR_RADIUS[] = "shadow-blur-radius";
    static constexpr char SETTING_FONT_EDGE[] = "edge";
    static constexpr char SETTING_FONT_EDGE_WIDTH[] = "edge-width";
    static constexpr char SETTING_FONT_EDGE_COLOR[] = "edge-color";

    SettingManager();

    // Returns 1 if the style was read; attributes that are missing in the file become empty or zero. Returns
    // 0, with style unchanged, if the file cannot be read.
    int loadLastTextParameter(FontStyle* style);

    // Returns 1 if the style was saved; 0 without a style or a folder, or if the file cannot be written.
    int saveLastTextParameter(FontStyle* style);

    // Rewrites the file with the style it contains, or with the defaults; always returns 1.
    int resetTextParameter();

    // Returns the folder of the imported fonts.
    std::wstring getImportFontsPath();

    // Convert between the attributes of an element and a style; always return 1.
    int getFontStyle(TiXmlElement* element, FontStyle* style);
    int setFontStyle(TiXmlElement* element, FontStyle* style);

    std::string getAttribute(TiXmlElement* element, std::string key);
    int getIntAttribute(TiXmlElement* element, std::string key);

private:
    std::string m_filePath;
};

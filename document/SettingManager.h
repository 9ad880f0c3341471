// The remembered text style. Made where it is needed; every call touches the file. GUI thread.
#pragma once

#include <string>

class FontStyle;
class TiXmlElement;

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

    // 1 when the style was read. 0 leaves it as it was; on 1 what the file lacks is empty or zero.
    int loadLastTextParameter(FontStyle* style);

    // 1 when the style was handed to the disk; a refused save is not reported. 0 without a style or a folder.
    int saveLastTextParameter(FontStyle* style);

    // Rewrites the file from what it holds, or from the defaults; 1.
    int resetTextParameter();

    // Folder of the imported fonts.
    std::wstring getImportFontsPath();

    // Attribute mapping; always 1.
    int getFontStyle(TiXmlElement* element, FontStyle* style);
    int setFontStyle(TiXmlElement* element, FontStyle* style);

    std::string getAttribute(TiXmlElement* element, std::string key);
    int getIntAttribute(TiXmlElement* element, std::string key);

private:
    std::string mFilePath;
};

#include "canvas/InputLanguageFonts.h"

namespace
{

const QString CHINESE_FAMILY = QStringLiteral("DFHeiW5-A");
const QString LATIN_FAMILY = QStringLiteral("KST");
const QString JAPANESE_FAMILY = QStringLiteral("KST Japanese Pro");
const QString KOREAN_FAMILY = QStringLiteral("YDGothic 100 Pro");

InputLanguageFonts::FontTable defaultTable()
{
    return {{{CHINESE_FAMILY, CHINESE_FAMILY},
             {LATIN_FAMILY, CHINESE_FAMILY},
             {LATIN_FAMILY, JAPANESE_FAMILY},
             {LATIN_FAMILY, KOREAN_FAMILY},
             {LATIN_FAMILY, LATIN_FAMILY}}};
}

struct Range {
    char16_t first;
    char16_t last;
};

constexpr Range LATIN_RANGES[] = {
    {0x0020, 0x007E}, // printable ASCII
    {0x0100, 0x017F}, // Latin Extended-A
    {0x0180, 0x024F}, // Latin Extended-B
    {0x1E00, 0x1EFF}, // Latin Extended Additional
    {0x2C60, 0x2C7F}, // Latin Extended-C
    {0xA720, 0xA7FF}, // Latin Extended-D
    {0x007F, 0x00FF}, // the upper half of an eight-bit Latin code page
    {0xFFE6, 0xFFE6}, // full-width won sign, which the Korean keyboard sends among Latin text
};

} // namespace

const InputLanguageFonts::FontTable InputLanguageFonts::LANGUAGE_DEFAULT_FONT = defaultTable();
InputLanguageFonts::FontTable InputLanguageFonts::LAST_KEEPED_FONT = defaultTable();
int InputLanguageFonts::mInputLanguage = 2;
bool InputLanguageFonts::IS_CN_MODULE = false;

int InputLanguageFonts::languageRow(SystemSetupDef::emInputLanguageType language)
{
    switch (language) {
    case SystemSetupDef::emInputLanguageKorean:
        return 3;
    case SystemSetupDef::emInputLanguageJapanese:
        return 2;
    case SystemSetupDef::emInputLanguageChineseSimplified:
        return 0;
    case SystemSetupDef::emInputLanguageChineseMixed:
        return 1;
    default:
        return LANGUAGE_ROWS - 1;
    }
}

int InputLanguageFonts::getSoftkeyboardMode(QChar character)
{
    for (const Range& range : LATIN_RANGES)
        if (character.unicode() >= range.first && character.unicode() <= range.last)
            return Latin;
    return Asian;
}

QString InputLanguageFonts::getDefaultFontAccordingToLanguage(QChar character, bool useLast)
{
    const FontTable& table = useLast ? LAST_KEEPED_FONT : LANGUAGE_DEFAULT_FONT;
    return table[size_t(mInputLanguage)][size_t(getSoftkeyboardMode(character))];
}

void InputLanguageFonts::replaceLastFontWithCurrentCharFont(QChar character, const std::string& family)
{
    const auto column = size_t(getSoftkeyboardMode(character));
    for (auto& row : LAST_KEEPED_FONT)
        row[column] = QString::fromStdString(family);
}

QString InputLanguageFonts::substituteFamily()
{
    return IS_CN_MODULE ? LANGUAGE_DEFAULT_FONT[0][Latin]
                        : LANGUAGE_DEFAULT_FONT[size_t(mInputLanguage)][Asian];
}

void InputLanguageFonts::fillLastFonts(const QString& family)
{
    for (auto& row : LAST_KEEPED_FONT)
        row.fill(family);
}

void InputLanguageFonts::resetLastFonts()
{
    LAST_KEEPED_FONT = LANGUAGE_DEFAULT_FONT;
}

#pragma once

#include "messaging/services/SystemSetupDef.h"

#include <QChar>
#include <QString>
#include <array>
#include <string>

// Which family a character gets that comes from another script than its neighbours: tables by input language
// and script class. The state is shared by all text objects of the process. GUI thread only.
class InputLanguageFonts
{
public:
    static constexpr int LANGUAGE_ROWS = 5;
    // Column of a script class.
    enum ScriptClass { Latin = 0, Asian = 1 };
    using FontTable = std::array<std::array<QString, 2>, LANGUAGE_ROWS>;

    static const FontTable LANGUAGE_DEFAULT_FONT;
    // The family used last, per language row and script class.
    static FontTable LAST_KEEPED_FONT;
    // Row of the tables, 0 to 4.
    static int mInputLanguage;
    static bool IS_CN_MODULE;

    // Row for a language of the keyboard service.
    static int languageRow(SystemSetupDef::emInputLanguageType language);
    static int getSoftkeyboardMode(QChar character);
    static QString getDefaultFontAccordingToLanguage(QChar character, bool useLast);
    static void replaceLastFontWithCurrentCharFont(QChar character, const std::string& family);
    // The family that stands in for one that is not installed.
    static QString substituteFamily();

    static void fillLastFonts(const QString& family);
    static void resetLastFonts();
};

#pragma once

#include "messaging/services/SystemSetupDef.h"

#include <QChar>
#include <QString>
#include <array>
#include <string>

// Chooses the family of a character whose script differs from that of its neighbours, from tables by input
// language and script class. All text objects of the process share the state. GUI thread only.
class InputLanguageFonts
{
public:
    static constexpr int LANGUAGE_ROWS = 5;
    // The column of a script class.
    enum ScriptClass { Latin = 0, Asian = 1 };
    using FontTable = std::array<std::array<QString, 2>, LANGUAGE_ROWS>;

    static const FontTable LANGUAGE_DEFAULT_FONT;
    // The family used last, by language row and script class.
    static FontTable LAST_KEEPED_FONT;
    // The current row of the tables, 0 to 4.
    static int mInputLanguage;
    static bool IS_CN_MODULE;

    // Returns the row for a language of the keyboard service.
    static int languageRow(SystemSetupDef::emInputLanguageType language);
    static int getSoftkeyboardMode(QChar character);
    static QString getDefaultFontAccordingToLanguage(QChar character, bool useLast);
    static void replaceLastFontWithCurrentCharFont(QChar character, const std::string& family);
    // Returns the family that replaces one that is not installed.
    static QString substituteFamily();

    static void fillLastFonts(const QString& family);
    static void resetLastFonts();
};

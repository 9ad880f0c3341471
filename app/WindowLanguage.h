#pragma once

#include "messaging/services/SystemSetupDef.h"

#include <QPointer>
#include <QString>
#include <QTranslator>

// The language of the program's texts: translation and font family. GUI thread.
class WindowLanguage
{
public:
    WindowLanguage() = default;
    ~WindowLanguage();
    WindowLanguage(const WindowLanguage&) = delete;
    WindowLanguage& operator=(const WindowLanguage&) = delete;

    // Loads the translation of the language and installs it in the application. Returns false when the file
    // cannot be loaded; the previous language is kept then.
    bool switchTranslator(SystemSetupDef::emSystemLanguageType language);

    static QString fontFamily(SystemSetupDef::emSystemLanguageType language);

private:
    QPointer<QTranslator> m_translator; // made at first use; a child of the application
    QString m_folder;
};

#include "app/WindowLanguage.h"

#include "support/SystemInfo.h"

#include <QCoreApplication>

WindowLanguage::~WindowLanguage()
{
    if (m_translator)
        m_translator->deleteLater();
}

bool WindowLanguage::switchTranslator(SystemSetupDef::emSystemLanguageType language)
{
    if (!m_translator) {
        m_translator = new QTranslator(QCoreApplication::instance());
        m_folder = QString::fromStdWString(SystemInfo::getInstance()->getPrefixPath()) +
                   QStringLiteral("/share/kestrel/translations/titler/");
    }
    const bool isChinese = language == SystemSetupDef::emSystemLanguageChinese;
    const QString file = m_folder + (isChinese ? QStringLiteral("cn.qm") : QStringLiteral("en.qm"));
    // A failed load empties the translator, so another one tries the file first, to keep the previous
    // language.
    if (QTranslator probe; !probe.load(file) || !m_translator->load(file))
        return false;
    QCoreApplication::installTranslator(m_translator);
    return true;
}

QString WindowLanguage::fontFamily(SystemSetupDef::emSystemLanguageType language)
{
    return language == SystemSetupDef::emSystemLanguageChinese ? QStringLiteral("DFHeiW5-A")
                                                               : QStringLiteral("KST");
}

#pragma once

#include "messaging/services/SystemSetupDef.h"

// Decides when the preset templates have to be read again: the set depends on the system language, unless it
// is pinned to Chinese.
class TemplateReloadRule
{
public:
    // language and pin are those of the set that is shown now.
    TemplateReloadRule(SystemSetupDef::emSystemLanguageType language, bool pin)
        : m_language(language), m_lastPin(pin)
    {
    }

    bool needsReload(SystemSetupDef::emSystemLanguageType language, bool pin) const
    {
        if (language == m_language)
            return pin && m_lastPin != pin;
        return pin != m_lastPin || !pin;
    }

    // Call after each reload.
    void reloaded(SystemSetupDef::emSystemLanguageType language, bool pin)
    {
        m_language = language;
        m_lastPin = pin;
    }

    SystemSetupDef::emSystemLanguageType language() const { return m_language; }

private:
    SystemSetupDef::emSystemLanguageType m_language;
    bool m_lastPin;
};

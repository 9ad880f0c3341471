#pragma once

#include "messaging/services/SystemSetupDef.h"

// Decides when the preset templates have to be read again: the set depends on the system language, unless it
// is pinned to Chinese.
class TemplateReloadRule
{
public:
    // language and pin are those of the set that is shown now.
    TemplateReloadRule(SystemSetupDef::emSystemLanguageType language, bool pin)
        : mLanguage(language), mLastPin(pin)
    {
    }

    bool needsReload(SystemSetupDef::emSystemLanguageType language, bool pin) const
    {
        if (language == mLanguage)
            return pin && mLastPin != pin;
        return pin != mLastPin || !pin;
    }

    // Call after each reload.
    void reloaded(SystemSetupDef::emSystemLanguageType language, bool pin)
    {
        mLanguage = language;
        mLastPin = pin;
    }

    SystemSetupDef::emSystemLanguageType language() const { return mLanguage; }

private:
    SystemSetupDef::emSystemLanguageType mLanguage;
    bool mLastPin;
};

// When the preset templates have to be read again: their set follows the system language, unless it is pinned
// to the Chinese one.
#pragma once

#include "messaging/services/SystemSetupDef.h"

class TemplateReloadRule
{
public:
    // For the set that is shown now.
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

    // To be told of each reload.
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

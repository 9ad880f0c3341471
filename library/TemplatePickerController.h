// Feeds the tab of the preset templates. GUI thread.
#pragma once

#include "library/ITemplateSource.h"
#include "messaging/services/SystemSetupDef.h"

#include <QVector>

class Archive;

class TemplatePickerController : public ITemplateSource
{
public:
    // The Chinese set for the Chinese language, and for every language while pin is set; else the English
    // one. The caller owns the records.
    QVector<Archive*> getTemplates(SystemSetupDef::emSystemLanguageType language, bool pin);
    std::string getLastSelectedTemplate() override;
    void saveSelectedTemplate(std::string path) override;
};

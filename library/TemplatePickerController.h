#pragma once

#include "library/ITemplateSource.h"
#include "messaging/services/SystemSetupDef.h"

#include <QVector>

class Archive;

// The source of the preset templates. GUI thread.
class TemplatePickerController : public ITemplateSource
{
public:
    // Returns the Chinese set for the Chinese language and, with pin, for every language; otherwise the
    // English set. The caller owns the records.
    QVector<Archive*> getTemplates(SystemSetupDef::emSystemLanguageType language, bool pin);
    std::string getLastSelectedTemplate() override;
    void saveSelectedTemplate(std::string path) override;
};

// The preset templates: read-only titles in a resource folder, one set for each language.
#pragma once

#include "document/ITemplateManager.h"

class TemplateManager : public ITemplateManager
{
public:
    static constexpr char TEMP_LAST_TEMPLATE[] = "last-template";
    static constexpr char TEMP_PATH[] = "path";

    // The shared instance, made on first use; cleanUp deletes it.
    static TemplateManager* getInstance();
    static void cleanUp();

    std::vector<Archive*> getTemplates(emTemplateLanguage language) override;

    // Of the set that was read last; before the first one, these stand in the system settings.
    std::string loadLastTemplatePath() override;
    int saveLastTemplatePath(std::string path) override;

private:
    static TemplateManager* mInstance;
    std::string mTemplateRootFolder;
    std::string mLanguageFolder;
};

#pragma once

#include "document/ITemplateManager.h"

// The preset templates: read-only titles in a resource folder, with one set for each language.
class TemplateManager : public ITemplateManager
{
public:
    static constexpr char TEMP_LAST_TEMPLATE[] = "last-template";
    static constexpr char TEMP_PATH[] = "path";

    // Returns the shared instance, which is created on first use; cleanUp deletes it.
    static TemplateManager* getInstance();
    static void cleanUp();

    std::vector<Archive*> getTemplates(emTemplateLanguage language) override;

    // Use the file in the folder of the set that was read last, or in the system settings folder before any
    // was read.
    std::string loadLastTemplatePath() override;
    int saveLastTemplatePath(std::string path) override;

private:
    static TemplateManager* mInstance;
    std::string mTemplateRootFolder;
    std::string m_languageFolder;
};

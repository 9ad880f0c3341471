#include "document/TemplateManager.h"

#include "document/ArchiveController.h"
#include "document/DocumentConstants.h"
#include "document/LastSettingParser.h"
#include "document/TitleParserUtility.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"

#include <boost/filesystem.hpp>
#include <iostream>

TemplateManager* TemplateManager::mInstance = nullptr;

namespace
{

// Returns an empty string if the folder is not configured or cannot be created.
std::string templatesRoot()
{
    return FolderLookup::multiByte(&IPathManagerEx::getTemplatesPath);
}

} // namespace

TemplateManager* TemplateManager::getInstance()
{
    if (!mInstance)
        mInstance = new TemplateManager;
    return mInstance;
}

void TemplateManager::cleanUp()
{
    delete mInstance;
    mInstance = nullptr;
}

std::vector<Archive*> TemplateManager::getTemplates(emTemplateLanguage language)
{
    if (mTemplateRootFolder.empty()) {
        mTemplateRootFolder = templatesRoot();
        std::cout << "mTemplateRootFolder = " << mTemplateRootFolder << std::endl;
    }
    if (mTemplateRootFolder.empty())
        return {};
    m_languageFolder =
        mTemplateRootFolder + (language == TEMPLATE_LANGUAGE_EN ? TEMPLATE_RES_EN : TEMPLATE_RES_CHS);
    const QList<Archive*> templates =
        ArchiveController().getArchiveList(QString::fromStdString(m_languageFolder));
    return {templates.begin(), templates.end()};
}

std::string TemplateManager::loadLastTemplatePath()
{
    return LastSettingParser(m_languageFolder).getTempAttribute(TEMP_LAST_TEMPLATE, TEMP_PATH);
}

int TemplateManager::saveLastTemplatePath(std::string path)
{
    return LastSettingParser(m_languageFolder).editTempFile(TEMP_LAST_TEMPLATE, TEMP_PATH, path);
}

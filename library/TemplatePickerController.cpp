#include "library/TemplatePickerController.h"

#include "document/TemplateManager.h"

#include <QFileInfo>

QVector<Archive*> TemplatePickerController::getTemplates(SystemSetupDef::emSystemLanguageType language,
                                                         bool pin)
{
    const bool isChinese = pin || language == SystemSetupDef::emSystemLanguageChinese;
    const std::vector<Archive*> templates = TemplateManager::getInstance()->getTemplates(
        isChinese ? TEMPLATE_LANGUAGE_CHS : TEMPLATE_LANGUAGE_EN);
    return QVector<Archive*>(templates.begin(), templates.end());
}

std::string TemplatePickerController::getLastSelectedTemplate()
{
    std::string path = TemplateManager::getInstance()->loadLastTemplatePath();
    return QFileInfo::exists(QString::fromStdString(path)) ? path : std::string();
}

void TemplatePickerController::saveSelectedTemplate(std::string path)
{
    TemplateManager::getInstance()->saveLastTemplatePath(std::move(path));
}

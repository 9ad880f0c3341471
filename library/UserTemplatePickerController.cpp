#include "library/UserTemplatePickerController.h"

#include "document/UserTemplateManager.h"
#include "library/TitleReports.h"

#include <QFileInfo>
#include <iostream>

QVector<Archive*> UserTemplatePickerController::getTemplates()
{
    const std::vector<Archive*> templates =
        UserTemplateManager::getInstance()->getTemplates(TEMPLATE_LANGUAGE_EN);
    return QVector<Archive*>(templates.begin(), templates.end());
}

std::string UserTemplatePickerController::getLastSelectedTemplate()
{
    std::string path = UserTemplateManager::getInstance()->loadLastTemplatePath();
    return QFileInfo::exists(QString::fromStdString(path)) ? path : std::string();
}

void UserTemplatePickerController::saveSelectedTemplate(std::string path)
{
    UserTemplateManager::getInstance()->saveLastTemplatePath(std::move(path));
}

int UserTemplatePickerController::loadTemplate(std::string name, Archive* archive)
{
    return UserTemplateManager::getInstance()->loadTemplate(std::move(name), archive);
}

int UserTemplatePickerController::addNewTemplateToLastInOrderXml(std::string name)
{
    return UserTemplateManager::getInstance()->addNewTemplateToLastInOrderXml(std::move(name));
}

int UserTemplatePickerController::removeFromOrderXml(std::string name)
{
    return UserTemplateManager::getInstance()->removeFromOrderXml(std::move(name));
}

int UserTemplatePickerController::createNewTemplateXml(std::string name, Archive* archive)
{
    return UserTemplateManager::getInstance()->createNewTemplateXml(std::move(name), archive);
}

int UserTemplatePickerController::renameInOrderXml(std::string oldName, std::string newName)
{
    std::cout << "renameInOrderXml " << oldName << " -> " << newName << std::endl;
    return UserTemplateManager::getInstance()->renameInOrderXml(std::move(oldName), std::move(newName));
}

int UserTemplatePickerController::reCreateNewOrderXml()
{
    return UserTemplateManager::getInstance()->reCreateNewOrderXml();
}

bool UserTemplatePickerController::isTemplatePath(const QString& path) const
{
    return UserTemplateManager::getInstance()->isTemplatePath(path.toStdString());
}

int UserTemplatePickerController::deleteTemplate(std::string path)
{
    const int result = UserTemplateManager::getInstance()->deleteTemplatePath(path);
    if (result != 0)
        TitleReports::titleChanged(FileManagerDefine::TITLE_TEMPLATE_ADDED, QString::fromStdString(path));
    return result;
}

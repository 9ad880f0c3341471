// Feeds the tab of the operator's own templates, and tells the file manager of those that are deleted there.
// Names are those of template folders. GUI thread.
#pragma once

#include "library/ITemplateSource.h"

#include <QString>
#include <QVector>

class Archive;

class UserTemplatePickerController : public ITemplateSource
{
public:
    // The caller owns the records.
    QVector<Archive*> getTemplates();
    std::string getLastSelectedTemplate() override;
    void saveSelectedTemplate(std::string path) override;

    // See UserTemplateManager for these.
    int loadTemplate(std::string name, Archive* archive);
    int addNewTemplateToLastInOrderXml(std::string name);
    int removeFromOrderXml(std::string name);
    int createNewTemplateXml(std::string name, Archive* archive);
    int renameInOrderXml(std::string oldName, std::string newName);
    int reCreateNewOrderXml();
    bool isTemplatePath(const QString& path) const;

    // Deletes the template with this title file and reports it. 0 when the title file stayed.
    int deleteTemplate(std::string path);
};

#pragma once

#include "library/ITemplateSource.h"

#include <QString>
#include <QVector>

class Archive;

// The source of the user templates; reports those that are deleted in the picker to the file manager. Names
// are those of template folders. GUI thread.
class UserTemplatePickerController : public ITemplateSource
{
public:
    // Returns the user templates; the caller owns the records.
    QVector<Archive*> getTemplates();
    std::string getLastSelectedTemplate() override;
    void saveSelectedTemplate(std::string path) override;

    // Forward to UserTemplateManager.
    int loadTemplate(std::string name, Archive* archive);
    int addNewTemplateToLastInOrderXml(std::string name);
    int removeFromOrderXml(std::string name);
    int createNewTemplateXml(std::string name, Archive* archive);
    int renameInOrderXml(std::string oldName, std::string newName);
    int reCreateNewOrderXml();
    bool isTemplatePath(const QString& path) const;

    // Deletes the template with this title file and reports it. Returns 0 when the title file could not be
    // deleted.
    int deleteTemplate(std::string path);
};

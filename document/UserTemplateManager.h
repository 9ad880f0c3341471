#pragma once

#include "document/ITemplateManager.h"

// The operator's own templates. Each is a folder below the user-template root with a title file "Titler.xml"
// and its pictures. The order file of the root lists them in the order in which they are shown.
class UserTemplateManager : public ITemplateManager
{
public:
    static constexpr char TEMP_LAST_TEMPLATE[] = "last-template";
    static constexpr char TEMP_PATH[] = "path";
    static constexpr char THUMBNAIL_SMALL[] = "_240";
    static constexpr char BG_SOURCE[] = "_source_1280";
    static constexpr char BG_SOURCE_BIG[] = "_source_1920";
    static constexpr char XML_EXTENSION[] = ".xml";

    // Returns the shared instance; cleanUp deletes it. The first call creates it and writes a new order file
    // with the existing templates, oldest first.
    static UserTemplateManager* getInstance();
    static void cleanUp();

    // Returns the same templates for every language. The name of a template is that of its folder followed by
    // "/Titler".
    std::vector<Archive*> getTemplates(emTemplateLanguage language) override;
    std::string loadLastTemplatePath() override;
    int saveLastTemplatePath(std::string path) override;

    // Calls makeFolderList() and createNewOrderXml().
    int reCreateNewOrderXml();

    // Reads the names of the templates from the root, sorted by the time of their title files. Returns 0
    // without a root.
    int makeFolderList();

    // Writes the order file from the names. Returns 0 without a root, -1 if writing fails.
    int createNewOrderXml();

    // Renames a template in the order file; the caller renames the folder. Returns 0, with nothing written,
    // if no template is called oldName.
    int renameInOrderXml(std::string oldName, std::string newName);

    // Moves or adds a template to the end of the order; always returns 1.
    int addNewTemplateToLastInOrderXml(std::string name);

    // Removes a template from the order. Returns 0, with nothing written, if there is no template of that
    // name.
    int removeFromOrderXml(std::string name);

    // Reads a template and sets the record's name to that of the folder, even if it cannot be read (result
    // 0).
    int loadTemplate(std::string name, Archive* archive);

    // Writes the title file of a template whose folder already contains its pictures, and sets the names of
    // the title file and the pictures in the record. Replaces an existing title file. Returns 0 if the name
    // is invalid or the folder does not exist, -1 if writing fails.
    int createNewTemplateXml(std::string name, Archive* archive);

    // Deletes the template with this title file, including its folder with all contents, and rebuilds the
    // order file. Paths outside the root are refused. Returns 1 if the title file was removed.
    int deleteTemplatePath(std::string path);

    // Returns whether a path is below the root after all links are resolved. A relative path is taken as
    // relative to the root.
    bool isTemplatePath(const std::string& path) const;

private:
    UserTemplateManager() = default;
    std::string titlePathOf(const std::string& name) const;
    bool isTemplateFolder(const std::string& folder) const;

    static UserTemplateManager* mInstance;
    std::string m_rootFolder;
    std::string m_settingFolder; // folder of the file with the last template; equals m_rootFolder
    std::vector<std::string> m_folderList;
};

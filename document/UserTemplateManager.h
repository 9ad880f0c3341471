// The operator's own templates. Each is a folder in the user-template root with a title file "Titler.xml" and
// its pictures; the order file of the root names them in the order in which they are shown.
#pragma once

#include "document/ITemplateManager.h"

class UserTemplateManager : public ITemplateManager
{
public:
    static constexpr char TEMP_LAST_TEMPLATE[] = "last-template";
    static constexpr char TEMP_PATH[] = "path";
    static constexpr char THUMBNAIL_SMALL[] = "_240";
    static constexpr char BG_SOURCE[] = "_source_1280";
    static constexpr char BG_SOURCE_BIG[] = "_source_1920";
    static constexpr char XML_EXTENSION[] = ".xml";

    // The shared instance. Its first use writes a new order file from what the root holds, oldest first;
    // cleanUp deletes it.
    static UserTemplateManager* getInstance();
    static void cleanUp();

    // The same for every language. A template's name here is its folder's and "/Titler".
    std::vector<Archive*> getTemplates(emTemplateLanguage language) override;
    std::string loadLastTemplatePath() override;
    int saveLastTemplatePath(std::string path) override;

    // Both steps below.
    int reCreateNewOrderXml();

    // Reads the names of the templates from the root, by the time of their title files. 0 without a root.
    int makeFolderList();

    // Writes the order file from the names. 0 without a root.
    int createNewOrderXml();

    // Gives a template another name in the order; the folder is the caller's. 0, with nothing written, when
    // no template is called oldName.
    int renameInOrderXml(std::string oldName, std::string newName);

    // Puts a template at the end of the order, where it may already stand elsewhere in it; 1.
    int addNewTemplateToLastInOrderXml(std::string name);

    // Takes a template out of the order, which stays as it is otherwise. 0, with nothing written, when none
    // has the name.
    int removeFromOrderXml(std::string name);

    // Reads a template and sets the record's name to that of the folder, also when it cannot be read (0).
    int loadTemplate(std::string name, Archive* archive);

    // Writes the title file of a template whose folder holds its pictures already, over one that is there,
    // and names title file and pictures in the record. 0 when there is no such folder, or no such name of a
    // folder; -1 when the disk refuses.
    int createNewTemplateXml(std::string name, Archive* archive);

    // Removes the template with this title file, its folder and all that this holds, and makes the order
    // anew. What lies elsewhere than below the root stays. 1 when the title file was removed.
    int deleteTemplatePath(std::string path);

    // Whether a path lies below the root with all links resolved. One that is not absolute is one in the
    // root.
    bool isTemplatePath(const std::string& path) const;

private:
    UserTemplateManager() = default;
    std::string titlePathOf(const std::string& name) const;
    bool isTemplateFolder(const std::string& folder) const;

    static UserTemplateManager* mInstance;
    std::string mRootFolder;
    std::string mSettingFolder; // of the template taken last; the same folder
    std::vector<std::string> mFolderList;
};

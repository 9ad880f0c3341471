// Titles as files, through TitleParser. Shared without a lock between threads: its only state is the path of
// the title root, which is looked up under a lock of its own.
#pragma once

#include "document/IArchiveManager.h"

class ArchiveManager : public IArchiveManager
{
public:
    static constexpr char TEMP_LASTFOLDER[] = "lastfolder";
    static constexpr char TEMP_LASTARCHIVE[] = "lastarchive";
    static constexpr char TEMP_PATH[] = "path";

    // The shared instance, made on first use; cleanUp deletes it. Private ones may be made beside it.
    static ArchiveManager* getInstance();
    static void cleanUp();

    std::vector<std::string> getArchiveFolderList() override;
    std::vector<Archive*> getAllArchives() override;
    std::vector<Archive*> getArchivesUnderFolder(std::string folder) override;
    std::vector<std::string> getFileListUnderFolder(std::string folder) override;
    std::vector<ArchiveOrder*> getArchivesSortUnderFolder(std::string folder) override;
    int setArchivesSortUnderFolder(std::string folder, std::vector<ArchiveOrder> rows) override;
    int saveArchive(std::string path, Archive* archive) override;
    int loadArchive(std::string path, Archive* archive) override;
    int deleteArchive(std::string path) override;
    std::string loadLastArchive() override;
    int saveLastArchive(std::string path) override;
    std::string loadLastFolder() override;
    int saveLastFolder(std::string path) override;
    int modifyClip(std::string path, std::string value) override;
    int modifyGain(std::string path, std::string value) override;
    int modifyDensity(std::string path, std::string value) override;
    int modifyProp(KeyDefine::TITLE_PROP_ID_t id, std::string path, std::string value) override;
    std::string getTitleRootFolderPath() override;
    int createNewOrderXML(std::string folder) override;

    // Saves to the path in the record.
    int saveArchive(Archive* archive);

    // Makes a new order file when a title of the folder has no file. 1 when it did.
    int checkFilesUnderFolder(std::string folder);

    // Whether a path is that of an XML file other than the order file, whatever the case of its letters. A
    // name that is not UTF-8 is none: such a file is neither shown nor cleaned up.
    static bool isTitleFile(const std::string& path);

    // Whether a name in a title file may be that of a picture beside it. A title file of foreign making must
    // not choose what else is written over or removed, so names that lead to another folder and those of XML
    // files are none, and the empty one is none either. A preset's background lies elsewhere and so is none.
    // Any thread.
    static bool isPictureName(const std::string& name);

private:
    static ArchiveManager* mInstance;
    std::string mTitleRootFolderPath;
};

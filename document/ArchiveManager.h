#pragma once

#include "document/IArchiveManager.h"

// Stores titles as files by means of TitleParser. Shared between threads without a lock: its only state is
// the path of the title root, which has a lock of its own.
class ArchiveManager : public IArchiveManager
{
public:
    static constexpr char TEMP_LASTFOLDER[] = "lastfolder";
    static constexpr char TEMP_LASTARCHIVE[] = "lastarchive";
    static constexpr char TEMP_PATH[] = "path";

    // Returns the shared instance, which is created on first use; cleanUp deletes it. Further instances may
    // be created.
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

    // If a title listed for the folder has no file, writes a new order file and returns 1; otherwise returns
    // 0.
    int checkFilesUnderFolder(std::string folder);

    // Returns whether path is an XML file other than the order file, ignoring case. False for a name that is
    // not UTF-8: such a file is neither shown nor cleaned up.
    static bool isTitleFile(const std::string& path);

    // Returns whether a name in a title file can be a picture beside it. An untrusted title file must not
    // decide which other files are overwritten or removed. Therefore false for an empty name, for names that
    // lead to another folder, and for XML files; also for the background of a preset, which is in another
    // folder. Any thread.
    static bool isPictureName(const std::string& name);

private:
    static ArchiveManager* mInstance;
    std::string mTitleRootFolderPath;
};

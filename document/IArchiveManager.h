// File-level service for titles. Strings are UTF-8. Results are 1 for done and 0 for refused, -1 where it was
// the disk that refused to write, with errno; the caller owns
// the records of a returned vector.
#pragma once

#include "document/KeyDefine.h"

#include <string>
#include <vector>

class Archive;
class ArchiveOrder;

class IArchiveManager
{
public:
    // Full paths of the title folders: the direct sub-folders of the title root.
    virtual std::vector<std::string> getArchiveFolderList() = 0;

    // The titles of all folders, of one folder in the order of its order file, and the XML files of a folder.
    virtual std::vector<Archive*> getAllArchives() = 0;
    virtual std::vector<Archive*> getArchivesUnderFolder(std::string folder) = 0;
    virtual std::vector<std::string> getFileListUnderFolder(std::string folder) = 0;

    virtual std::vector<ArchiveOrder*> getArchivesSortUnderFolder(std::string folder) = 0;
    virtual int setArchivesSortUnderFolder(std::string folder, std::vector<ArchiveOrder> rows) = 0;

    // Writes the file that the record names; path is only tested for being empty.
    virtual int saveArchive(std::string path, Archive* archive) = 0;

    // Reads the title and sets its order, which also happens when the read failed. The name is not set.
    virtual int loadArchive(std::string path, Archive* archive) = 0;

    // Removes a title that can be read, with the pictures beside it; the order file is left to the caller.
    virtual int deleteArchive(std::string path) = 0;

    // Remembered paths; empty when there is none.
    virtual std::string loadLastArchive() = 0;
    virtual int saveLastArchive(std::string path) = 0;
    virtual std::string loadLastFolder() = 0;
    virtual int saveLastFolder(std::string path) = 0;

    // Change one key parameter of a title file in place.
    virtual int modifyClip(std::string path, std::string value) = 0;
    virtual int modifyGain(std::string path, std::string value) = 0;
    virtual int modifyDensity(std::string path, std::string value) = 0;
    virtual int modifyProp(KeyDefine::TITLE_PROP_ID_t id, std::string path, std::string value) = 0;

    virtual std::string getTitleRootFolderPath() = 0;

    // Writes an order file that names the XML files of the folder by name.
    virtual int createNewOrderXML(std::string folder) = 0;

    virtual ~IArchiveManager() {}
};

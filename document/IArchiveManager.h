#pragma once

#include "document/KeyDefine.h"

#include <string>
#include <vector>

class Archive;
class ArchiveOrder;

// Reads and writes titles as files. Strings are UTF-8. Results are 1 for success, 0 for invalid arguments or
// data, and -1, with errno, if the disk refused to write. The caller owns the records of a returned vector.
class IArchiveManager
{
public:
    // Returns the full paths of the title folders, which are the direct sub-folders of the title root.
    virtual std::vector<std::string> getArchiveFolderList() = 0;

    // Return the titles of all folders, the titles of one folder in the order of its order file, and the XML
    // files of a folder, respectively.
    virtual std::vector<Archive*> getAllArchives() = 0;
    virtual std::vector<Archive*> getArchivesUnderFolder(std::string folder) = 0;
    virtual std::vector<std::string> getFileListUnderFolder(std::string folder) = 0;

    virtual std::vector<ArchiveOrder*> getArchivesSortUnderFolder(std::string folder) = 0;
    virtual int setArchivesSortUnderFolder(std::string folder, std::vector<ArchiveOrder> rows) = 0;

    // Writes the file that the record names; path is only tested for being empty.
    virtual int saveArchive(std::string path, Archive* archive) = 0;

    // Reads the title and sets its order, even if reading failed. Does not set the name.
    virtual int loadArchive(std::string path, Archive* archive) = 0;

    // Removes a readable title with the pictures beside it. The caller updates the order file.
    virtual int deleteArchive(std::string path) = 0;

    // The remembered paths; empty if there is none.
    virtual std::string loadLastArchive() = 0;
    virtual int saveLastArchive(std::string path) = 0;
    virtual std::string loadLastFolder() = 0;
    virtual int saveLastFolder(std::string path) = 0;

    // Change one keyer parameter of a title file in place.
    virtual int modifyClip(std::string path, std::string value) = 0;
    virtual int modifyGain(std::string path, std::string value) = 0;
    virtual int modifyDensity(std::string path, std::string value) = 0;
    virtual int modifyProp(KeyDefine::TITLE_PROP_ID_t id, std::string path, std::string value) = 0;

    virtual std::string getTitleRootFolderPath() = 0;

    // Writes an order file that lists the XML files of the folder sorted by name.
    virtual int createNewOrderXML(std::string folder) = 0;

    virtual ~IArchiveManager() {}
};

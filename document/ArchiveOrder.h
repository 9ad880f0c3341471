#pragma once

#include <string>

// One row of the order file of a folder. Copied freely.
class ArchiveOrder
{
public:
    int getArchiveIndex() const { return mArchiveIndex; }
    void setArchiveIndex(int index) { mArchiveIndex = index; }

    // The file name of the title, relative to the folder.
    const std::string& getArchivePath() const { return mArchivePath; }
    void setArchivePath(const std::string& path) { mArchivePath = path; }

private:
    int mArchiveIndex = -1;
    std::string mArchivePath;
};

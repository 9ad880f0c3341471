// One row of the order list of a folder. Copied freely.
#pragma once

#include <string>

class ArchiveOrder
{
public:
    int getArchiveIndex() const { return mArchiveIndex; }
    void setArchiveIndex(int index) { mArchiveIndex = index; }

    // File name of the title, relative to the folder.
    const std::string& getArchivePath() const { return mArchivePath; }
    void setArchivePath(const std::string& path) { mArchivePath = path; }

private:
    int mArchiveIndex = -1;
    std::string mArchivePath;
};

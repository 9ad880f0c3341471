#pragma once

#include <string>

// One row of the order file of a folder. Copied freely.
class ArchiveOrder
{
public:
    int getArchiveIndex() const { return m_archiveIndex; }
    void setArchiveIndex(int index) { m_archiveIndex = index; }

    // The file name of the title, relative to the folder.
    const std::string& getArchivePath() const { return m_archivePath; }
    void setArchivePath(const std::string& path) { m_archivePath = path; }

private:
    int m_archiveIndex = -1;
    std::string m_archivePath;
};

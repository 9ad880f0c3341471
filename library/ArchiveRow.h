#pragma once

#include "touchui/ScrollViewerRow.h"

#include <cstddef>
#include <memory>
#include <string>

class Archive;
class FolderTitles;
class ListedTitles;

// A title as a row of the list. The list has a row for each title of a folder; the item and its record are
// made when the row scrolls into view. GUI thread only.
class ArchiveRow : public ScrollViewerRow
{
public:
    // Makes a row for a title whose file is read when the record is needed. number is its index in the
    // titles; record may be null. The owner, which makes the item, must outlive the row.
    ArchiveRow(ListedTitles& owner, std::shared_ptr<const FolderTitles> titles, std::size_t number,
               std::unique_ptr<Archive> record);
    // Makes a row for a title that exists as a record only.
    ArchiveRow(ListedTitles& owner, std::unique_ptr<Archive> record);
    ~ArchiveRow() override;

    QSize size() const override;
    KSBaseItemWidget* makeWidget() override;

    std::size_t number() const { return m_number; }
    // Returns the full path of the title file; empty for a blank row.
    const std::string& path() const { return m_path; }

    // Returns the record, reading it from the file if needed. Null when the file cannot be read.
    std::unique_ptr<Archive> takeRecord();
    // Takes back the record of an item that is given back. It is dropped if it can be read from the file
    // again.
    void putBack(std::unique_ptr<Archive> record);
    // Returns whether the last call of takeRecord() could not read the file.
    bool isUnreadable() const { return m_isUnreadable; }

private:
    ListedTitles& m_owner;
    std::shared_ptr<const FolderTitles> m_titles;
    std::size_t m_number = 0;
    std::string m_path;
    std::unique_ptr<Archive> m_record;
    bool m_isUnreadable = false;
};

// A title as a row of the list. The list keeps these for all titles of a folder; the item, and with it the
// record, is made when the row comes into view. GUI thread only.
#pragma once

#include "touchui/ScrollViewerRow.h"

#include <cstddef>
#include <memory>
#include <string>

class Archive;
class ArchiveList;
class FolderTitles;

class ArchiveRow : public ScrollViewerRow
{
public:
    // A title whose file is read when the record is needed. number is that of the row among the titles, which
    // are shared; the record may be at hand already. The list must outlive the row.
    ArchiveRow(ArchiveList& list, std::shared_ptr<const FolderTitles> titles, std::size_t number,
               std::unique_ptr<Archive> record);
    // A title of which there is only the record.
    ArchiveRow(ArchiveList& list, std::unique_ptr<Archive> record);
    ~ArchiveRow() override;

    QSize size() const override;
    KSBaseItemWidget* makeWidget() override;

    std::size_t number() const { return mNumber; }
    // Full path of the title file; empty for a blank row.
    const std::string& path() const { return mPath; }

    // The record at hand, or else that of the file. Null when the file cannot be read.
    std::unique_ptr<Archive> takeRecord();
    // Takes the record of an item that is no longer needed. What is in the file is not kept.
    void putBack(std::unique_ptr<Archive> record);
    // Whether the file could not be read when the record was needed.
    bool isUnreadable() const { return mIsUnreadable; }

private:
    ArchiveList& mList;
    std::shared_ptr<const FolderTitles> mTitles;
    std::size_t mNumber = 0;
    std::string mPath;
    std::unique_ptr<Archive> mRecord;
    bool mIsUnreadable = false;
};

#include "library/ArchiveRow.h"

#include "document/Archive.h"
#include "document/FolderTitles.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"

#include <utility>

ArchiveRow::ArchiveRow(ArchiveList& list, std::shared_ptr<const FolderTitles> titles, std::size_t number,
                       std::unique_ptr<Archive> record)
    : mList(list)
    , mTitles(std::move(titles))
    , mNumber(number)
    , mPath(mTitles->path(number))
    , mRecord(std::move(record))
{
}

ArchiveRow::ArchiveRow(ArchiveList& list, std::unique_ptr<Archive> record)
    : mList(list), mPath(record->getPath()), mRecord(std::move(record))
{
}

ArchiveRow::~ArchiveRow() = default;

QSize ArchiveRow::size() const
{
    return QSize(ArchiveItem::WIDGET_WIDTH, ArchiveItem::WIDGET_HEIGHT);
}

KSBaseItemWidget* ArchiveRow::makeWidget()
{
    return mList.makeItem(*this);
}

std::unique_ptr<Archive> ArchiveRow::takeRecord()
{
    if (!mRecord && mTitles)
        mRecord = mTitles->read(mNumber);
    mIsUnreadable = !mRecord;
    return std::move(mRecord);
}

void ArchiveRow::putBack(std::unique_ptr<Archive> record)
{
    if (!mTitles)
        mRecord = std::move(record);
}

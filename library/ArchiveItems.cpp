#include "library/ArchiveItems.h"

#include "document/Archive.h"
#include "library/ArchiveItem.h"
#include "library/SmallPictures.h"

#include <QStringList>
#include <algorithm>
#include <utility>

ArchiveItems::ArchiveItems(QWidget* list) : mList(list)
{
}

ArchiveItems::~ArchiveItems() = default;

ArchiveItem* ArchiveItems::make(Archive* record)
{
    auto* item = new ArchiveItem(record, ArchiveItem::LIST_ITEM, mList);
    mItems.append(item);
    return item;
}

Archive* ArchiveItems::own(std::unique_ptr<Archive> record)
{
    mRecords.push_back(std::move(record));
    return mRecords.back().get();
}

ArchiveItem* ArchiveItems::find(const QString& path) const
{
    for (ArchiveItem* item : mItems)
        if (item->getArchiveDataPath() == path)
            return item;
    return nullptr;
}

QList<ArchiveItem*> ArchiveItems::beginToComplete()
{
    mIncomplete.clear();
    QStringList paths;
    for (ArchiveItem* item : std::as_const(mItems)) {
        if (item->hasChildWidgets())
            continue;
        mIncomplete.append(item);
        paths.append(item->getArchiveData()->getFullPathOfThumbnailSmall());
    }
    mPictures.reset();
    if (!paths.isEmpty())
        mPictures = std::make_unique<SmallPictures>(paths, ArchiveItem::PICTURE_SIZE);
    return mIncomplete;
}

void ArchiveItems::complete(ArchiveItem* item)
{
    if (!mItems.contains(item))
        return;
    const qsizetype place = mIncomplete.indexOf(item);
    if (!item->hasChildWidgets())
        item->initArchiveItemChildWidget(place >= 0 ? mPictures->take(place) : QImage());
    if (place >= 0 && place == mIncomplete.size() - 1) {
        mPictures.reset();
        mIncomplete.clear();
    }
}

std::unique_ptr<Archive> ArchiveItems::take(ArchiveItem* item)
{
    mItems.removeOne(item);
    const auto found = std::find_if(mRecords.begin(), mRecords.end(), [item](const auto& record) {
        return record.get() == item->getArchiveData();
    });
    std::unique_ptr<Archive> record;
    if (found != mRecords.end()) {
        record = std::move(*found);
        mRecords.erase(found);
    }
    item->discard();
    return record;
}

// Discards the items without deleting them at once: another item may still have to receive the touch event
// that is being delivered.
void ArchiveItems::clear()
{
    mPictures.reset();
    mIncomplete.clear();
    for (ArchiveItem* item : std::as_const(mItems))
        item->discard();
    mItems.clear();
    mRecords.clear();
}

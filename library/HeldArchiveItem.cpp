#include "library/HeldArchiveItem.h"

#include "library/ArchiveItem.h"

HeldArchiveItem::HeldArchiveItem(ArchiveItem* item)
{
    hold(item);
}

HeldArchiveItem::HeldArchiveItem(const HeldArchiveItem& other)
{
    hold(other.mItem);
}

HeldArchiveItem& HeldArchiveItem::operator=(const HeldArchiveItem& other)
{
    hold(other.mItem);
    return *this;
}

HeldArchiveItem::~HeldArchiveItem()
{
    hold(nullptr);
}

void HeldArchiveItem::hold(ArchiveItem* item)
{
    if (item)
        item->hold();
    if (mItem)
        mItem->letGo();
    mItem = item;
}

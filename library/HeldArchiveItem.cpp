#include "library/HeldArchiveItem.h"

#include "library/ArchiveItem.h"

HeldArchiveItem::HeldArchiveItem(ArchiveItem* item)
{
    hold(item);
}

HeldArchiveItem::HeldArchiveItem(const HeldArchiveItem& other)
{
    hold(other.m_item);
}

HeldArchiveItem& HeldArchiveItem::operator=(const HeldArchiveItem& other)
{
    hold(other.m_item);
    return *this;
}

HeldArchiveItem::~HeldArchiveItem()
{
    hold(nullptr);
}

HeldArchiveItem::operator ArchiveItem*() const
{
    return m_item;
}

ArchiveItem* HeldArchiveItem::operator->() const
{
    return m_item;
}

void HeldArchiveItem::hold(ArchiveItem* item)
{
    if (item)
        item->hold();
    if (m_item)
        m_item->letGo();
    m_item = item;
}

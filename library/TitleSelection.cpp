#include "library/TitleSelection.h"

#include "library/ArchiveItem.h"

ArchiveItem* TitleSelection::selected() const
{
    return m_selected;
}

ArchiveItem* TitleSelection::operation() const
{
    return m_operation;
}

void TitleSelection::select(ArchiveItem* item)
{
    if (item)
        m_selected = HeldArchiveItem(item);
}

void TitleSelection::showSelected(ArchiveItem* item)
{
    if (!item)
        return;
    item->setLook(ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    item->setSelected(true);
}

void TitleSelection::showDefault(ArchiveItem* item)
{
    if (!item)
        return;
    item->setLook(ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    item->setSelected(false);
}

void TitleSelection::mark(ArchiveItem* item)
{
    if (!item)
        return;
    m_operation = HeldArchiveItem(item);
    item->setLook(item == m_selected ? ArchiveItem::OPERATE_AND_SELECT_STATE
                                     : ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
}

void TitleSelection::removeBorder(ArchiveItem* item) const
{
    if (!item)
        return;
    item->setLook(item == m_selected ? ArchiveItem::UN_OPERATE_AND_SELECT_STATE
                                     : ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
}

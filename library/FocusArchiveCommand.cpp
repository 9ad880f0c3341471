#include "library/FocusArchiveCommand.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"

FocusArchiveCommand::FocusArchiveCommand(ArchiveList* list, ArchiveItem* item, ArchiveItem* oldItem,
                                         QUndoCommand* parent)
    : QUndoCommand(parent), m_list(list), m_item(item), m_oldItem(oldItem)
{
}

bool FocusArchiveCommand::mergeWith(const QUndoCommand* other)
{
    if (other->id() != id())
        return false;
    const auto* next = static_cast<const FocusArchiveCommand*>(other);
    if (next->m_list != m_list)
        return false;
    m_item = next->m_item;
    return true;
}

void FocusArchiveCommand::redo()
{
    if (m_skipFirst)
        m_skipFirst = false;
    else
        changeFocus(m_oldItem, m_item);
}

void FocusArchiveCommand::undo()
{
    changeFocus(m_item, m_oldItem);
}

void FocusArchiveCommand::changeFocus(ArchiveItem* from, ArchiveItem* to)
{
    if (from == to || !ArchiveItem::isUsable(to))
        return;
    m_list->setDefaultItemState(from);
    m_list->setSelectItemState(to);
    m_list->saveLastArchivePathAndNotifyCanvasUpdate(to);
}

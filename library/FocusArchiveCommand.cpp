#include "library/FocusArchiveCommand.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"

FocusArchiveCommand::FocusArchiveCommand(ArchiveList* list, ArchiveItem* item, ArchiveItem* oldItem,
                                         QUndoCommand* parent)
    : QUndoCommand(parent), mList(list), mItem(item), mOldItem(oldItem)
{
}

bool FocusArchiveCommand::mergeWith(const QUndoCommand* other)
{
    if (other->id() != id())
        return false;
    const auto* next = static_cast<const FocusArchiveCommand*>(other);
    if (next->mList != mList)
        return false;
    mItem = next->mItem;
    return true;
}

void FocusArchiveCommand::redo()
{
    if (mSkipFirst)
        mSkipFirst = false;
    else
        changeFocus(mOldItem, mItem);
}

void FocusArchiveCommand::undo()
{
    changeFocus(mItem, mOldItem);
}

void FocusArchiveCommand::changeFocus(ArchiveItem* from, ArchiveItem* to)
{
    if (from == to || !ArchiveItem::isUsable(to))
        return;
    mList->setDefaultItemState(from);
    mList->setSelectItemState(to);
    mList->saveLastArchivePathAndNotifyCanvasUpdate(to);
}

#include "library/MoveArchiveCommand.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ITitlerFolderReporter.h"

MoveArchiveCommand::MoveArchiveCommand(ArchiveList* list, ArchiveItem* item, int source, int destination,
                                       QUndoCommand* parent)
    : QUndoCommand(parent), mList(list), mItem(item), mSource(source), mDestination(destination)
{
}

void MoveArchiveCommand::redo()
{
    if (mSkipFirst)
        mSkipFirst = false;
    else
        moveTo(mDestination);
}

void MoveArchiveCommand::undo()
{
    moveTo(mSource);
    mList->slotMenuAboutToClose();
}

void MoveArchiveCommand::moveTo(int position)
{
    if (!ArchiveItem::isUsable(mItem))
        return;
    mList->removeWidgetItem(mItem);
    mList->addWidgetItem(mItem, position);
    mList->saveArchiveListOrder();
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->updateTitlerOrder(mList->getCurrentPath());
}

QList<ArchiveOrder*> MoveArchiveCommand::getArchiveOrderList() const
{
    return mList->getArchiveOrderList();
}

#include "library/DeleteArchiveCommand.h"

#include "document/ArchiveOrder.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/TitleReports.h"

DeleteArchiveCommand::DeleteArchiveCommand(ArchiveList* list, ArchiveItem* item, int position,
                                           bool isSelected, QUndoCommand* parent)
    : QUndoCommand(parent), mList(list), mItem(item), mPosition(position), mIsSelected(isSelected)
{
}

void DeleteArchiveCommand::redo()
{
    if (!ArchiveItem::isUsable(mItem))
        return;
    const QString path = mItem->getArchiveDataPath();
    // The selection may differ on redo, since selecting a title is not an undo step while the stack is clean.
    mIsSelected = mIsSelected || mList->getSelectedArchive() == mItem;
    mItem->hide();
    mList->removeWidgetItem(mItem);
    mList->saveArchiveListOrder();
    TitleReports::titleChanged(FileManagerDefine::TITLE_DELETED, path);
    if (TitleReports::isNewInContext(path)) {
        TitleReports::removeFromContext(path);
        mIsNewInContext = true;
    }
    if (mIsSelected)
        mList->selectArchive(qMin(mPosition, mList->count() - 1));
}

void DeleteArchiveCommand::undo()
{
    if (!ArchiveItem::isUsable(mItem))
        return;
    const QString path = mItem->getArchiveDataPath();
    mList->addWidgetItem(mItem, mPosition);
    mList->saveArchiveListOrder();
    if (mIsSelected)
        mList->selectArchive(mPosition);
    if (mIsNewInContext)
        TitleReports::addToContext(path);
    TitleReports::titleChanged(FileManagerDefine::TITLE_ADDED, path);
}

QList<ArchiveOrder*> DeleteArchiveCommand::getArchiveOrderList() const
{
    return mList->getArchiveOrderList();
}

#include "library/PasteArchiveCommand.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/TitleReports.h"

PasteArchiveCommand::PasteArchiveCommand(ArchiveList* list, Archive* archive, int operationPosition,
                                         int selectedPosition, QUndoCommand* parent)
    : QUndoCommand(parent)
    , mList(list)
    , mItem(list->createPasteUndoItem(archive, nullptr))
    // The title on which the menu was opened may have been removed meanwhile.
    , mOperationPosition(qBound(-1, operationPosition, list->count() - 1))
    , mSelectedPosition(selectedPosition)
{
}

void PasteArchiveCommand::redo()
{
    setText(QStringLiteral("PasteArchiveCommand-redo"));
    if (!ArchiveItem::isUsable(mItem))
        return;
    const QString path = mItem->getArchiveDataPath();
    mList->addWidgetItem(mItem, mOperationPosition + 1);
    mList->saveArchiveListOrder();
    TitleReports::addToContext(path);
    TitleReports::titleChanged(FileManagerDefine::TITLE_ADDED, path);
    mList->selectArchive(mOperationPosition + 1);
    if (mDoneOnce == 0) {
        mList->selectOperationArchive(mOperationPosition + 1);
        mDoneOnce = 1;
    }
}

void PasteArchiveCommand::undo()
{
    setText(QStringLiteral("PasteArchiveCommand-undo"));
    if (!ArchiveItem::isUsable(mItem))
        return;
    const QString path = mItem->getArchiveDataPath();
    mItem->hide();
    mList->removeWidgetItem(mItem);
    mList->saveArchiveListOrder();
    TitleReports::titleChanged(FileManagerDefine::TITLE_DELETED, path);
    TitleReports::removeFromContext(path);
    mList->selectArchive(mSelectedPosition);
}

// Move mode of the title list: titles are dragged by their handles to another place.
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ITitlerFolderReporter.h"
#include "library/MoveArchiveCommand.h"

void ArchiveList::moveButtonClicked(bool isMoveMode)
{
    mMoveMode = isMoveMode ? 1 : 0;
    if (isMoveMode)
        finishCheck();
    Q_EMIT signalItemsCanDrag(isMoveMode);
    if (!isMoveMode)
        clearOperationItemState(mOperationItem);
}

void ArchiveList::itemPressedAndHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget*,
                                          bool& willMenuPopup)
{
    if (mMoveMode != 0 || !item)
        return;
    const QWidget* right = item->getRightChild();
    willMenuPopup = right && right->geometry().contains(pos);
}

// A drag on an item scrolls.
void ArchiveList::itemFlickEvent(KSBaseItemWidget* item, QPoint, KSScrollViewerWidget*, bool& willFlick)
{
    if (item)
        willFlick = true;
}

void ArchiveList::slotDragOneItem(KSBaseItemWidget* item, int index, KSScrollViewerWidget*)
{
    mDraggedItem = qobject_cast<ArchiveItem*>(item);
    clearOperationItemState(mOperationItem);
    setOperationItemState(mDraggedItem);
    mMoveSource = index;
    mMoving = true;
}

void ArchiveList::slotItemDrop()
{
    mMoving = false;
    saveArchiveListOrder();
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->updateTitlerOrder(mCurrentPath);
    ArchiveItem* item = mDraggedItem;
    const int position = getItemIndex(item);
    if (position < 0)
        return;
    mOperationPosition = position;
    mPressPosition = position;
    setOperationItemState(item);
    mMoveDestination = position;
    if (mMoveSource != mMoveDestination)
        Q_EMIT moveCommandSignal(new MoveArchiveCommand(this, item, mMoveSource, mMoveDestination, nullptr));
    mDraggedItem.clear();
}

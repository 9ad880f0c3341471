// Adds a title, new or pasted, behind the operation item.
#pragma once

#include "library/HeldArchiveItem.h"

#include <QUndoCommand>

class Archive;
class ArchiveItem;
class ArchiveList;

class PasteArchiveCommand : public QUndoCommand
{
public:
    // Makes the item. The list and the record must outlive the command; positions below 0 mean none.
    PasteArchiveCommand(ArchiveList* list, Archive* archive, int operationPosition, int selectedPosition,
                        QUndoCommand* parent = nullptr);

    void redo() override;
    void undo() override;

private:
    ArchiveList* mList;
    HeldArchiveItem mItem;
    int mOperationPosition;
    int mSelectedPosition;
    int mDoneOnce = 0;
};

#pragma once

#include "library/HeldArchiveItem.h"

#include <QUndoCommand>

class Archive;
class ArchiveItem;
class ArchiveList;

// Adds a new or pasted title after the operation item.
class PasteArchiveCommand : public QUndoCommand
{
public:
    // Makes the item. The list and the record must outlive the command; negative positions mean none.
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

// Takes a title out of the list. Its files stay until the folder is next brought in step with its order file,
// so that undo needs no file contents.
#pragma once

#include "library/HeldArchiveItem.h"

#include <QList>
#include <QUndoCommand>

class ArchiveItem;
class ArchiveList;
class ArchiveOrder;

class DeleteArchiveCommand : public QUndoCommand
{
public:
    // The list must outlive the command. An item that the list has dropped meanwhile makes it do nothing.
    DeleteArchiveCommand(ArchiveList* list, ArchiveItem* item, int position, bool isSelected,
                         QUndoCommand* parent = nullptr);

    void redo() override;
    void undo() override;

    // One entry a listed title as of now; the caller owns the entries.
    QList<ArchiveOrder*> getArchiveOrderList() const;

private:
    ArchiveList* mList;
    HeldArchiveItem mItem;
    int mPosition;
    bool mIsSelected;
    bool mIsNewInContext = false;
};

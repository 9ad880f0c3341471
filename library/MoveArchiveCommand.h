// Moves a title to another place in the list. Describes a drag that the list has already made.
#pragma once

#include "library/HeldArchiveItem.h"

#include <QList>
#include <QUndoCommand>

class ArchiveItem;
class ArchiveList;
class ArchiveOrder;

class MoveArchiveCommand : public QUndoCommand
{
public:
    MoveArchiveCommand(ArchiveList* list, ArchiveItem* item, int source, int destination,
                       QUndoCommand* parent = nullptr);

    void redo() override;
    void undo() override;

    // One entry a listed title as of now; the caller owns the entries.
    QList<ArchiveOrder*> getArchiveOrderList() const;

private:
    void moveTo(int position);

    ArchiveList* mList;
    HeldArchiveItem mItem;
    int mSource;
    int mDestination;
    bool mSkipFirst = true;
};

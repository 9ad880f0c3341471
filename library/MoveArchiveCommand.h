#pragma once

#include "library/HeldArchiveItem.h"

#include <QList>
#include <QUndoCommand>

class ArchiveItem;
class ArchiveList;
class ArchiveOrder;

// Moves a title to another place in the list. The list has already carried out the drag.
class MoveArchiveCommand : public QUndoCommand
{
public:
    MoveArchiveCommand(ArchiveList* list, ArchiveItem* item, int source, int destination,
                       QUndoCommand* parent = nullptr);

    void redo() override;
    void undo() override;

    // Returns the current order of the listed titles; the caller owns the entries.
    QList<ArchiveOrder*> getArchiveOrderList() const;

private:
    void moveTo(int position);

    ArchiveList* m_list;
    HeldArchiveItem m_item;
    int m_source;
    int m_destination;
    bool m_skipFirst = true;
};

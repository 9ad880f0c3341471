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
    ArchiveList* m_list;
    HeldArchiveItem m_item;
    int m_operationPosition;
    int m_selectedPosition;
    int m_doneOnce = 0;
};

#pragma once

#include "library/HeldArchiveItem.h"

#include <QList>
#include <QUndoCommand>

class ArchiveItem;
class ArchiveList;
class ArchiveOrder;

// Removes a title from the list. Its files stay until the folder is next synchronised with its order file, so
// undo does not need to restore them.
class DeleteArchiveCommand : public QUndoCommand
{
public:
    // The list must outlive the command. Does nothing when the list has discarded the item.
    DeleteArchiveCommand(ArchiveList* list, ArchiveItem* item, int position, bool isSelected,
                         QUndoCommand* parent = nullptr);

    void redo() override;
    void undo() override;

    // Returns the current order of the listed titles; the caller owns the entries.
    QList<ArchiveOrder*> getArchiveOrderList() const;

private:
    ArchiveList* m_list;
    HeldArchiveItem m_item;
    int m_position;
    bool m_isSelected;
    bool m_isNewInContext = false;
};

#pragma once

#include "library/HeldArchiveItem.h"

#include <QUndoCommand>

class ArchiveItem;
class ArchiveList;

// A change of the selected title, which the list has already carried out. Consecutive changes are merged into
// one undo step.
class FocusArchiveCommand : public QUndoCommand
{
public:
    static const int FOCUS_COMMAND_ID = 1;

    FocusArchiveCommand(ArchiveList* list, ArchiveItem* item, ArchiveItem* oldItem,
                        QUndoCommand* parent = nullptr);

    int id() const override { return FOCUS_COMMAND_ID; }
    bool mergeWith(const QUndoCommand* other) override;
    void redo() override;
    void undo() override;

private:
    void changeFocus(ArchiveItem* from, ArchiveItem* to);

    ArchiveList* m_list;
    HeldArchiveItem m_item;
    HeldArchiveItem m_oldItem;
    bool m_skipFirst = true;
};

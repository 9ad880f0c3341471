// A change of the selected title. Describes a tap that the list has already carried out; a run of taps merges
// into one step.
#pragma once

#include "library/HeldArchiveItem.h"

#include <QUndoCommand>

class ArchiveItem;
class ArchiveList;

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

    ArchiveList* mList;
    HeldArchiveItem mItem;
    HeldArchiveItem mOldItem;
    bool mSkipFirst = true;
};

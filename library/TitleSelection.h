#pragma once

#include "library/HeldArchiveItem.h"

class ArchiveItem;

// Keeps which items of the title list are marked, and sets their looks: the selected one is the title on the
// canvas; the operation item, shown by a border, is the one that the menu or a drag acts on. Items may be
// destroyed meanwhile. GUI thread.
class TitleSelection
{
public:
    ArchiveItem* selected() const;
    ArchiveItem* operation() const;

    // Change which item is marked, or its look; null is ignored. The caller has to reset the look of the item
    // that was marked before.
    void select(ArchiveItem* item);
    // Gives the item the look of the selected one, without a border.
    static void showSelected(ArchiveItem* item);
    static void showDefault(ArchiveItem* item);
    void mark(ArchiveItem* item);
    void removeBorder(ArchiveItem* item) const;

    void forgetSelected() { m_selected.clear(); }
    void forgetOperation() { m_operation.clear(); }

private:
    HeldArchiveItem m_selected;
    HeldArchiveItem m_operation;
};

#pragma once

#include <QPointer>

class ArchiveItem;

// Which items of the title list are marked, and their looks: the selected one is the title on the canvas, the
// operation item is the one that the menu or a drag acts on, shown by a border. Items may be destroyed
// meanwhile. GUI thread.
class TitleSelection
{
public:
    ArchiveItem* selected() const;
    ArchiveItem* operation() const;

    // Null is ignored by all of these. The looks of the item that was marked before are the caller's matter.
    void select(ArchiveItem* item);
    // Gives the item the looks of the selected one, without a border.
    static void showSelected(ArchiveItem* item);
    static void showDefault(ArchiveItem* item);
    void mark(ArchiveItem* item);
    void removeBorder(ArchiveItem* item) const;

    void forgetSelected() { m_selected.clear(); }
    void forgetOperation() { m_operation.clear(); }

private:
    QPointer<ArchiveItem> m_selected;
    QPointer<ArchiveItem> m_operation;
};

#pragma once

#include <QPointer>

class ArchiveItem;

// A title's item that an undo command needs later: while it is held, the list does not give it back. Null
// after the list was emptied. GUI thread only.
class HeldArchiveItem
{
public:
    explicit HeldArchiveItem(ArchiveItem* item);
    HeldArchiveItem(const HeldArchiveItem& other);
    HeldArchiveItem& operator=(const HeldArchiveItem& other);
    ~HeldArchiveItem();

    operator ArchiveItem*() const { return m_item; }
    ArchiveItem* operator->() const { return m_item; }

private:
    void hold(ArchiveItem* item);

    QPointer<ArchiveItem> m_item;
};

// A title's item that an undo command will need again: while it is held the list does not give its widgets
// back. Null once the list has been emptied. GUI thread only.
#pragma once

#include <QPointer>

class ArchiveItem;

class HeldArchiveItem
{
public:
    explicit HeldArchiveItem(ArchiveItem* item);
    HeldArchiveItem(const HeldArchiveItem& other);
    HeldArchiveItem& operator=(const HeldArchiveItem& other);
    ~HeldArchiveItem();

    operator ArchiveItem*() const { return mItem; }
    ArchiveItem* operator->() const { return mItem; }

private:
    void hold(ArchiveItem* item);

    QPointer<ArchiveItem> mItem;
};

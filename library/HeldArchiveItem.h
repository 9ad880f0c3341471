#pragma once

#include <QPointer>

class ArchiveItem;

// A title's item that is needed later: while it is held, the list does not give it back. Null after the list
// was emptied. GUI thread only.
class HeldArchiveItem
{
public:
    HeldArchiveItem() = default;
    explicit HeldArchiveItem(ArchiveItem* item);
    HeldArchiveItem(const HeldArchiveItem& other);
    HeldArchiveItem& operator=(const HeldArchiveItem& other);
    ~HeldArchiveItem();

    operator ArchiveItem*() const;
    ArchiveItem* operator->() const;
    void clear() { hold(nullptr); }

private:
    void hold(ArchiveItem* item);

    QPointer<ArchiveItem> m_item;
};

#pragma once

#include <QList>
#include <QString>
#include <memory>
#include <vector>

class Archive;
class ArchiveItem;
class QWidget;
class SmallPictures;

// The items of the title list and their records, including those that only an undo command still holds.
// Completes items with their pictures and texts. GUI thread only.
class ArchiveItems
{
public:
    // The items become children of the list, which is not owned.
    explicit ArchiveItems(QWidget* list);
    ~ArchiveItems();
    ArchiveItems(const ArchiveItems&) = delete;
    ArchiveItems& operator=(const ArchiveItems&) = delete;

    // Makes an item without child widgets. The record must outlive the item.
    ArchiveItem* make(Archive* record);
    // Keeps the record until its item is taken or all items are cleared.
    Archive* own(std::unique_ptr<Archive> record);

    const QList<ArchiveItem*>& all() const { return m_items; }
    // Returns the item of the title file, or null.
    ArchiveItem* find(const QString& path) const;

    // Returns the items without child widgets and starts decoding their pictures in another thread.
    QList<ArchiveItem*> beginToComplete();
    // Creates the child widgets of the item. Does nothing for an item that was taken or is complete.
    void complete(ArchiveItem* item);
    // Returns whether all items returned by beginToComplete() are complete.
    bool isComplete() const { return m_incomplete.isEmpty(); }

    // Discards the item and returns its record; null if that is not owned here.
    std::unique_ptr<Archive> take(ArchiveItem* item);
    // Discards all items, including those held by undo commands, which check for that.
    void clear();

private:
    QWidget* m_list;
    std::vector<std::unique_ptr<Archive>> m_records;
    QList<ArchiveItem*> m_items;
    QList<ArchiveItem*> m_incomplete;
    std::unique_ptr<SmallPictures> m_pictures; // pictures of m_incomplete, in the same order
};

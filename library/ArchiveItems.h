// The items of the title list and the records that they show, also those that only an undo command still
// holds. Completes items with their pictures and texts. GUI thread only.
#pragma once

#include <QList>
#include <QString>
#include <memory>
#include <vector>

class Archive;
class ArchiveItem;
class QWidget;
class SmallPictures;

class ArchiveItems
{
public:
    // The items become children of the list, which is not owned.
    explicit ArchiveItems(QWidget* list);
    ~ArchiveItems();
    ArchiveItems(const ArchiveItems&) = delete;
    ArchiveItems& operator=(const ArchiveItems&) = delete;

    // A new item without its child widgets. The record must live as long.
    ArchiveItem* make(Archive* record);
    // Keeps the record until its item is taken or all are cleared.
    Archive* own(std::unique_ptr<Archive> record);

    const QList<ArchiveItem*>& all() const { return mItems; }
    // Null when no item has this title file.
    ArchiveItem* find(const QString& path) const;

    // Returns the items that have no child widgets, and begins to decode their pictures on another core.
    QList<ArchiveItem*> beginToComplete();
    // Gives the item its child widgets. An item that is gone or complete is left alone.
    void complete(ArchiveItem* item);
    // Whether all items that were begun with are complete.
    bool isComplete() const { return mIncomplete.isEmpty(); }

    // Ends the item and returns its record; null when that was not owned here.
    std::unique_ptr<Archive> take(ArchiveItem* item);
    // Ends all items. Those that undo commands hold, too: the commands see it.
    void clear();

private:
    QWidget* mList;
    std::vector<std::unique_ptr<Archive>> mRecords;
    QList<ArchiveItem*> mItems;
    QList<ArchiveItem*> mIncomplete;
    std::unique_ptr<SmallPictures> mPictures; // of the incomplete ones, in their order
};

#pragma once

#include "library/ArchiveItems.h"
#include "library/TitleRows.h"

#include <QList>
#include <QObject>
#include <QString>
#include <memory>
#include <string>
#include <unordered_set>
#include <utility>

class Archive;
class ArchiveItem;
class ArchiveOrder;
class ArchiveRow;
class KSScrollViewerWidget;

// The titles of a folder as the rows of a list: makes their items when they are needed and gives them back in
// a long folder, finds them, and removes the rows of files that turn out not to be titles. GUI thread.
class ListedTitles : public QObject
{
    Q_OBJECT

public:
    // The list shows the rows and is the parent of the items; it is not owned and must outlive this object.
    explicit ListedTitles(KSScrollViewerWidget& list);
    ~ListedTitles() override;

    // Add rows to the list: the titles of the folder in its order, or the records, of which this object takes
    // ownership.
    void add(const QString& folder);
    void add(const QList<Archive*>& records);
    // Ends the check and discards all items, including those held by undo commands, which check for that.
    void clear();

    // Returns the item, which is made if necessary; null for an index out of range.
    ArchiveItem* item(int index) const;
    // Returns the item of the row or, if its file cannot be read, removes the row and returns the item of the
    // next one.
    ArchiveItem* readableItem(int index);
    // Returns the full path of the title file without making an item. Empty for an index out of range.
    QString path(int index) const;
    // Returns the row of the title file; -1 if there is none.
    int find(const QString& path) const;
    // Returns the item of the title file, even if only an undo command still holds it, or null.
    ArchiveItem* findItem(const QString& path) const;
    // Returns whether the title of the row can be read. If not, the row is removed.
    bool isReadable(int index);
    // Returns all items, including those that only undo commands still hold.
    const QList<ArchiveItem*>& items() const { return m_items.all(); }

    // Makes an item without child widgets. The record must outlive the item.
    ArchiveItem* makeItem(Archive* record) { return m_items.make(record); }
    // Makes the item of a row, with its record. Called by the row.
    ArchiveItem* makeItem(ArchiveRow& row);
    // Keeps the record for an item that is about to be made.
    Archive* own(std::unique_ptr<Archive> record) { return m_items.own(std::move(record)); }

    // Emits contentsRequested() unless that is already on its way.
    void requestContents();
    // Returns the items whose child widgets are to be created, and starts decoding their pictures.
    QList<ArchiveItem*> beginToComplete();
    // Creates the child widgets of the item. Does nothing for an item that was taken or is complete.
    void complete(ArchiveItem* item);

    // Returns the index that a row has after others were removed, whose indexes are in ascending order.
    static int rowAfterRemoval(int row, const QList<int>& removed);

    // Returns whether the folder has as many titles as allowed. For a long folder it waits for the check when
    // the result depends on it.
    bool isFull();
    // Waits for a running check of the titles. Call before the list is changed, since the check still changes
    // the rows.
    void finishCheck();

    // Returns the index and file name of each title; the caller owns the entries.
    QList<ArchiveOrder*> order() const;
    // Returns the file names of all items, including those that only undo commands still hold.
    std::unordered_set<std::string> fileNames() const;

Q_SIGNALS:
    // Emitted when items were made whose child widgets are missing.
    void contentsRequested();
    // Emitted when rows, in ascending order, were removed because their files cannot be read.
    void unreadableRemoved(const QList<int>& rows);

private:
    ArchiveRow* row(int index) const;
    ArchiveItem* madeItem(int index) const;
    void beginCheck();
    void removeUnreadable();
    void requestGiveBack();
    void giveBackItems();

    KSScrollViewerWidget& m_list;
    TitleRows m_rows;
    ArchiveItems m_items;
    bool m_contentsRequested = false;
    bool m_giveBackRequested = false;
};

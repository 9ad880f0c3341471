#pragma once

#include "support/FolderLock.h"

#include <QList>
#include <QString>
#include <string>
#include <unordered_set>

class ArchiveController;
class ArchiveOrder;

// The folder whose titles the list shows, with its order file. GUI thread.
class ListedFolder
{
public:
    // The controller is not owned and must outlive this object.
    explicit ListedFolder(ArchiveController& controller);

    // Returns the full path; empty if no folder is open.
    const QString& path() const { return m_path; }
    // Returns the name without the folders above it.
    QString name() const;
    bool isOpen() const { return !m_path.isEmpty(); }

    // Returns the path of the last folder used or, if that does not exist any more, of the first one; empty
    // if there is none.
    QString lastUsed() const;
    void setPath(const QString& path) { m_path = path; }
    // Clears the path and releases the lock.
    void close();
    // Locks the folder against programs that write titles there, unless it is locked by this object. The
    // operator is not kept waiting for another program that holds the lock: the list goes on, and tries again
    // with the next title.
    void lock();
    // Locks the folder and makes the order file complete. Call before the titles are read.
    void prepareOrder();
    // Saves the order. If the disk refuses it, it is kept and written later. known: the names of all title
    // files that have an item; rows of the old order whose titles could not be read keep their place.
    void saveOrder(const QList<ArchiveOrder*>& order, const std::unordered_set<std::string>& known);
    // Returns whether the order file does not match the list: its last write was refused, or another program
    // has damaged it.
    bool isOrderDamaged() const;
    // Removes the files of titles that the order does not name, unless it could not be read when the folder
    // was opened, or not be written since.
    void removeUnlisted();

    // Report to the sibling processes that this folder is being edited, and that it no longer is. Each start
    // needs an end, otherwise the folder stays locked for them.
    void reportStart() const;
    void reportEnd() const;
    void reportOrder() const;

private:
    // Whether unlisted title files of the folder may be removed. Withheld when the order could not be read or
    // written, until the folder is opened again.
    enum class CleanUp { Allowed, Withheld };

    ArchiveController& m_controller;
    QString m_path;
    FolderLock m_lock;
    CleanUp m_cleanUp = CleanUp::Withheld;
};

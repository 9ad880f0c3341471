// Finds the titles of a long folder that cannot be read, slice by slice, so that the list can leave them out
// without having waited for all of them. Keeps no records.
#pragma once

#include <QMutex>
#include <QSet>
#include <QThread>
#include <atomic>
#include <cstddef>
#include <memory>

class FolderTitles;

class ArchiveCheckThread : public QThread
{
    Q_OBJECT

public:
    // Looks at the rows from the first one on.
    ArchiveCheckThread(std::shared_ptr<const FolderTitles> titles, std::size_t first,
                       QObject* parent = nullptr);
    // Waits for the title that is being read, not for the others.
    ~ArchiveCheckThread() override;

    // Starts the thread, unless it has been started. GUI thread.
    void begin();
    // Returns the rows found since the last call. Any thread.
    QSet<std::size_t> takeUnreadable();

Q_SIGNALS:
    // There are unreadable titles to be taken. Sent from this thread.
    void unreadableFound();

protected:
    void run() override;

private:
    QSet<std::size_t> unreadableIn(std::size_t first, std::size_t count) const;

    std::shared_ptr<const FolderTitles> mTitles;
    std::size_t mFirst;
    bool mHasBegun = false;
    std::atomic<bool> mCancelled{false};
    QMutex mMutex; // guards mUnreadable
    QSet<std::size_t> mUnreadable;
};

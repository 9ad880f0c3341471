#pragma once

#include <QMutex>
#include <QSet>
#include <QThread>
#include <atomic>
#include <cstddef>
#include <memory>

class FolderTitles;

// Checks the titles of a long folder in slices for those that cannot be read, so that the list can be shown
// before all are checked. Keeps no records.
class ArchiveCheckThread : public QThread
{
    Q_OBJECT

public:
    // Checks the rows starting at first.
    ArchiveCheckThread(std::shared_ptr<const FolderTitles> titles, std::size_t first,
                       QObject* parent = nullptr);
    // Ends the thread after the title that is being read.
    ~ArchiveCheckThread() override;

    // Starts the thread if it is not started yet. GUI thread.
    void begin();
    // Returns the unreadable rows found since the last call. Any thread.
    QSet<std::size_t> takeUnreadable();

Q_SIGNALS:
    // Emitted by this thread when takeUnreadable() has new rows.
    void unreadableFound();

protected:
    void run() override;

private:
    QSet<std::size_t> unreadableIn(std::size_t first, std::size_t count) const;

    std::shared_ptr<const FolderTitles> m_titles;
    std::size_t m_first;
    bool m_hasBegun = false;
    std::atomic<bool> m_cancelled{false};
    QMutex m_mutex; // guards m_unreadable
    QSet<std::size_t> m_unreadable;
};

#pragma once

#include <QObject>
#include <QSet>
#include <QString>
#include <cstddef>
#include <memory>
#include <vector>

class ArchiveCheckThread;
class ArchiveList;
class ScrollViewerRow;

// Makes the rows of a folder for the title list. Which of its files are titles depends on what they hold:
// those of a long folder are checked by and by in a thread. GUI thread.
class TitleRows : public QObject
{
    Q_OBJECT

public:
    TitleRows();
    ~TitleRows() override;

    // Reads the folder in its order. At least one row is known to be a title, if there is any. The check of
    // the others waits for beginCheck(); a check of the folder before is given up.
    std::vector<std::unique_ptr<ScrollViewerRow>> read(ArchiveList& list, const QString& folder);
    // Returns how many rows are known to be titles.
    int readAtOnce() const { return m_readAtOnce; }

    bool isChecking() const { return m_check != nullptr; }
    void beginCheck();
    // Blocks until all files are checked.
    void waitForCheck();
    // Returns the numbers of the files that have turned out to be no titles since the last call.
    QSet<std::size_t> takeUnreadable();
    void endCheck();

Q_SIGNALS:
    void unreadableFound();

private:
    std::unique_ptr<ArchiveCheckThread> m_check; // while places of titles are not final
    int m_readAtOnce = 0;
};

#pragma once

#include <QObject>
#include <QSet>
#include <QString>
#include <cstddef>
#include <memory>
#include <vector>

class ArchiveCheckThread;
class ListedTitles;
class ScrollViewerRow;

// Makes the rows of a folder for the title list. Whether a file is a title depends on its contents: the files
// of a long folder are checked gradually in a thread. GUI thread.
class TitleRows : public QObject
{
    Q_OBJECT

public:
    TitleRows();
    ~TitleRows() override;

    // Reads the folder in its order, as rows of the owner. Checks files until at least one title is found, if
    // there is any.
    // beginCheck() starts the check of the others; a running check of the previous folder is ended.
    std::vector<std::unique_ptr<ScrollViewerRow>> read(ListedTitles& owner, const QString& folder);
    // Returns how many rows were found to be titles when the folder was read.
    int readAtOnce() const { return m_readAtOnce; }

    bool isChecking() const { return m_check != nullptr; }
    void beginCheck();
    // Blocks until all files are checked.
    void waitForCheck();
    // Returns the numbers of the files found not to be titles since the last call.
    QSet<std::size_t> takeUnreadable();
    void endCheck();

Q_SIGNALS:
    void unreadableFound();

private:
    std::unique_ptr<ArchiveCheckThread> m_check; // exists while rows may still be removed
    int m_readAtOnce = 0;
};

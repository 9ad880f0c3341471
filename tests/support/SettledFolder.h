#pragma once

#include "support/FileSyncQueue.h"

#include <QDir>
#include <QStringList>

#include <chrono>

// Returns the names of all entries of a folder, including hidden ones. First waits until saved files are
// synced, since until then the previous version exists beside a saved file.
inline QStringList settledEntries(const QString& folder)
{
    FileSyncQueue::flush(std::chrono::seconds(30));
    return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot, QDir::Name);
}

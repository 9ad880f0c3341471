#pragma once

#include "support/FileSyncQueue.h"

#include <QDir>
#include <QStringList>

#include <chrono>

// Lists everything in a folder by name, hidden files too. Waits first for the disk to take what was saved:
// until then the version before lies beside a saved file.
inline QStringList settledEntries(const QString& folder)
{
    FileSyncQueue::flush(std::chrono::seconds(30));
    return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot, QDir::Name);
}

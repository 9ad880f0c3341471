#pragma once

#include "support/FolderLock.h"

#include <QStringList>
#include <memory>
#include <vector>

class Output;

// The locks of the folders that a command works on.
class FolderLocks
{
public:
    enum class InUse { Refuse, GoOn };

    // Takes the locks of all folders and keeps them as long as this object exists. Returns false if one is in
    // use, after a message that names it; with GoOn such a folder is used without its lock. In a folder that
    // is locked for writing, what killed processes have left is cleaned up.
    bool take(const QStringList& folders, FolderLock::Kind kind, InUse inUse, Output& output);

private:
    std::vector<std::unique_ptr<FolderLock>> m_locks;
};

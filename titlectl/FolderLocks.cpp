#include "titlectl/FolderLocks.h"

#include "support/LeftoverSweep.h"
#include "titlectl/Output.h"

bool FolderLocks::take(const QStringList& folders, FolderLock::Kind kind, InUse inUse, Output& output)
{
    for (const QString& folder : folders) {
        auto lock = std::make_unique<FolderLock>();
        // A file system without locks is used without one.
        const FolderLock::Result result = lock->take(folder.toStdString(), kind);
        if (result == FolderLock::Result::Busy && inUse == InUse::Refuse) {
            output.message(
                QStringLiteral("%1 is in use: the titler has it open, or another program works on it "
                               "(--force goes on all the same)")
                    .arg(folder));
            return false;
        }
        if (result == FolderLock::Result::Taken && kind == FolderLock::Kind::Exclusive)
            LeftoverSweep::sweep(folder.toStdString());
        m_locks.push_back(std::move(lock));
    }
    return true;
}

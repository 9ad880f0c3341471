#pragma once

#include <string>

// Keeps two programs from working on the same folder at once: the titler holds an exclusive lock on the
// folder that it has open, other programs ask for one before they write there.
//
// The lock is an advisory one on the folder itself. It leaves no file, is not copied with the folder, follows
// the folder when it is renamed, and ends with the process, however that ends. Not synchronised: one thread
// at a time.
class FolderLock
{
public:
    enum class Kind {
        Shared,    // for readers: many may hold it, but not beside an exclusive one
        Exclusive, // for writers
    };
    enum class Result {
        Taken,
        Busy,   // another holder has a lock that excludes this one
        Failed, // there is no such folder, or its file system has no locks
    };

    FolderLock() = default;
    ~FolderLock();
    FolderLock(const FolderLock&) = delete;
    FolderLock& operator=(const FolderLock&) = delete;

    // Takes the lock of the folder without waiting, after releasing the one that is held. A lock that is held
    // already for this path and of this kind is kept.
    Result take(const std::string& folder, Kind kind);
    void release();
    bool isHeld() const { return m_descriptor >= 0; }

private:
    int m_descriptor = -1;
    std::string m_folder;
    Kind m_kind = Kind::Shared;
};

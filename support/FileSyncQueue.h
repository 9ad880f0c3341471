#pragma once

#include <chrono>
#include <functional>
#include <string>
#include <vector>

// Syncs files that were renamed into place to the disk on a background thread, so that the thread that saved
// them need not wait. Until a file is synced, the version that was on the disk before is kept as a hidden
// hard link beside it; after a power cut LeftoverSweep restores that version.
//
// All functions may be called from any thread; only flush and syncFolder wait for the disk.
class FileSyncQueue
{
public:
    // Renames temporary to path, keeps the last version known to be on the disk, and queues path. Returns
    // false, with nothing changed, if the rename fails.
    static bool publish(const std::string& temporary, const std::string& path);

    // Renames a temporary file whose bytes are synced already. The caller syncs the folder.
    static bool publishSynced(const std::string& temporary, const std::string& path);

    // Queues a file that is already in place but may not be on the disk yet.
    static void enqueue(const std::string& path);

    // Syncs the entries of a folder and waits for that. Returns false if the disk fails.
    static bool syncFolder(const std::string& folder);

    // Selects what happens to a kept version that LeftoverSweep found.
    enum class Kept { Discard, DiscardAfterSync, Restore };

    // Applies the decision to the kept version of path. Does nothing if this process has queued the file,
    // because the kept version is still needed then.
    static void settleKept(const std::string& path, Kept decision);

    // Waits at most this long until all queued files are on the disk; returns whether they are.
    static bool flush(std::chrono::milliseconds deadline);

    // Returns the files that are queued and those that could not be synced. The latter are in place for every
    // reader, and their previous version is still kept.
    static std::vector<std::string> unsynced();
    static bool hasFailed();
    // Writes and queues again the files that could not be synced.
    static void retryFailed();
    // Sets the function that the background thread calls when a sync has failed; null removes it.
    static void setListener(std::function<void()> listener);
};

// Brings files that were renamed into place to the disk on a background thread, so that the thread that saved
// them need not wait. Until that is done, the version that was on the disk before is kept under a hidden hard
// link beside the file; if the power goes first, LeftoverSweep puts it back.
//
// All functions may be called from any thread; none but flush and syncFolder waits for the disk.
#pragma once

#include <chrono>
#include <functional>
#include <string>
#include <vector>

class FileSyncQueue
{
public:
    // Renames temporary over path, keeping the last version known to be on the disk, and queues path. False,
    // with nothing changed, when the rename fails.
    static bool publish(const std::string& temporary, const std::string& path);

    // Renames a temporary whose bytes are on the disk already. The folder is left to the caller.
    static bool publishSynced(const std::string& temporary, const std::string& path);

    // Queues a file that is in its place, but of which it is not sure that it is on the disk.
    static void enqueue(const std::string& path);

    // Brings the entries of a folder to the disk, and waits for it. False when the disk fails.
    static bool syncFolder(const std::string& folder);

    // What becomes of a kept version that a sweep found.
    enum class Kept { Discard, DiscardAfterSync, Restore };

    // Does nothing for a file that this process has queued: its kept version is in use.
    static void settleKept(const std::string& path, Kept decision);

    // Waits until all that is queued is on the disk, at most as long as given. True when it is.
    static bool flush(std::chrono::milliseconds deadline);

    // Files that are queued, and those that the disk failed to take although they are in their place for
    // every reader. Of these the version before is still kept.
    static std::vector<std::string> unsynced();
    static bool hasFailed();
    // Writes and queues those that failed once more.
    static void retryFailed();
    // Called by the background thread when the disk has failed. Null: nobody is told.
    static void setListener(std::function<void()> listener);
};

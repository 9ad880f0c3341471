// Brings files that were renamed into place to the disk on a background thread, so that the thread that saved
// them need not wait. Until that is done, the version that was on the disk before is kept under a hidden hard
// link beside the file; if the power goes first, LeftoverSweep puts it back.
//
// All functions may be called from any thread; none but flush waits for the disk.
#pragma once

#include <chrono>
#include <string>

class FileSyncQueue
{
public:
    // Renames temporary over path, keeping the last version known to be on the disk, and queues path. False,
    // with nothing changed, when the rename fails.
    static bool publish(const std::string& temporary, const std::string& path);

    // Renames a temporary whose bytes are on the disk already. The folder is left to the caller.
    static bool publishSynced(const std::string& temporary, const std::string& path);

    // Queues a file that was written in place.
    static void enqueue(const std::string& path);

    // What becomes of a kept version that a sweep found.
    enum class Kept { Discard, DiscardAfterSync, Restore };

    // Does nothing for a file that this process has queued: its kept version is in use.
    static void settleKept(const std::string& path, Kept decision);

    // Waits until all that is queued is on the disk, at most as long as given. True when it is.
    static bool flush(std::chrono::milliseconds deadline);
};

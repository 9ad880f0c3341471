#pragma once

#include <cstddef>
#include <string>
#include <string_view>

// Reads and writes whole files. A write puts the bytes into a temporary file beside the target and renames it
// over the target. Readers in this and in other processes therefore see either the old file or the new one,
// never a part of it; after a crash, a full disk or a power cut the old file is still there unless the new
// one is complete.
//
// A write from the main thread never waits for the disk: the last version known to be on the disk is kept
// under a hidden name until a background thread has synced the new one (see FileSyncQueue). LeftoverSweep
// removes or restores what a killed process left behind.
class AtomicFile
{
public:
    enum class Durability {
        Automatic, // SyncLater on the main thread, SyncNow on any other
        SyncNow,   // synced to the disk when the call returns
        SyncLater, // synced by the background thread
    };

    // Selects what happens if the path of a write is a symbolic link.
    enum class Links {
        Follow,  // the file that it leads to is written
        Replace, // the link is replaced by a file; the file it led to is not changed
    };

    // Replaces the file at path, or creates it. Returns false, with the old file unchanged and errno set, if
    // that fails: the disk is full, the folder is missing or read-only, or the file itself is not writable.
    // An existing file keeps its permissions except write permission for group and others. Bytes that
    // RefusedWrites kept for the file before this call are dropped once this write succeeds. Any thread.
    static bool write(const std::string& path, std::string_view bytes,
                      Durability durability = Durability::Automatic, Links links = Links::Follow);

    // Replaces target by a copy of the file source, as write does. If target is a link, the link is replaced.
    static bool copy(const std::string& source, const std::string& target,
                     Durability durability = Durability::Automatic);

    // Reads a regular file of at most maximum bytes; returns false for anything else, errno says why. Tries
    // again when the disk reports an error. Never blocks on a pipe or device. Any thread.
    static bool read(const std::string& path, std::size_t maximum, std::string& bytes);
};

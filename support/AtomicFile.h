// Whole-file reads and writes. A write puts the bytes beside the target and renames them over it, so that
// readers in this and other processes see the old file or the new one and never a part, and a killed process,
// a full disk or a cut power leaves the old file where the new one is not complete.
//
// A write from the main thread never waits for the disk: the last version known to be on the disk is kept
// under a hidden name until a background thread has brought the new one there (see FileSyncQueue).
// LeftoverSweep tidies up after a process that had no time to.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

class AtomicFile
{
public:
    enum class Durability {
        Automatic, // SyncLater on the main thread, SyncNow on any other
        SyncNow,   // on the disk when the call returns
        SyncLater, // brought to the disk by the background thread
    };

    // What a symbolic link at the path of a write means.
    enum class Links {
        Follow,  // the file that it leads to is written
        Replace, // a file takes its place; what it leads to is left alone
    };

    // Replaces the file at path, or makes it. False, with the old file untouched, when that cannot be done:
    // the disk is full, the folder is missing or read-only, the file itself is not writable. The permissions
    // of an existing file stay, but for those to write of others than its owner. errno says why it cannot be
    // done. What RefusedWrites kept for the file before is forgotten once this is written. Any thread.
    static bool write(const std::string& path, std::string_view bytes,
                      Durability durability = Durability::Automatic, Links links = Links::Follow);

    // Replaces target by a copy of the file source, as write does. A link at target is replaced.
    static bool copy(const std::string& source, const std::string& target,
                     Durability durability = Durability::Automatic);

    // Reads a plain file of at most maximum bytes; false otherwise, errno says why. Tries again when the disk
    // reports an error. Never waits on a pipe or device. Any thread.
    static bool read(const std::string& path, std::size_t maximum, std::string& bytes);
};

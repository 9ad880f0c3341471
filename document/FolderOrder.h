#pragma once

#include "document/ArchiveOrder.h"

#include <string>
#include <vector>

// The order file of a folder: which titles it shows, and in which order. It is replaced as a whole, so that a
// reader gets either the old rows or the new ones.
//
// If the order file is complete, only the titles it lists are shown. If it is missing or cannot be read, all
// title files of the folder are shown, sorted by name. Any thread.
class FolderOrder
{
public:
    enum class State {
        Whole,
        Missing,
        Torn,       // the file is not a valid order file
        Unreadable, // a read error; the file may be intact
    };

    // Reads the rows in document order; rows is empty unless the result is Whole. Skips rows without a
    // number.
    static State read(const std::string& folder, std::vector<ArchiveOrder>& rows);
    static State stateOf(const std::string& folder);

    // Returns the rows; if they cannot be read, one row for each title file, sorted by name.
    static std::vector<ArchiveOrder> rowsToShow(const std::string& folder);

    // Returns one row for each title file among these, sorted by name.
    static std::vector<ArchiveOrder> rowsByName(const std::vector<std::string>& files);

    // Replaces the order file. Returns false, with errno set and the old file unchanged, on failure.
    static bool write(const std::string& folder, const std::vector<ArchiveOrder>& rows);

    // As write; on failure the rows are kept and written later (RefusedWrites).
    static bool writeOrKeep(const std::string& folder, const std::vector<ArchiveOrder>& rows);

    // Returns whether rows of this folder could not be written yet and are kept.
    static bool isKept(const std::string& folder);

private:
    static std::string pathIn(const std::string& folder);
    static std::string toBytes(const std::vector<ArchiveOrder>& rows);
};

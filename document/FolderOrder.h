// The order file of a folder: which titles it shows, and in which order. Replaced as a whole, so that a
// reader finds the old rows or the new ones.
//
// A whole order file is taken at its word: what it does not name is not shown. Where there is none, or none
// that can be read, every title file of the folder is shown, by its name. Any thread.
#pragma once

#include "document/ArchiveOrder.h"

#include <string>
#include <vector>

class FolderOrder
{
public:
    enum class State {
        Whole,
        Missing,
        Torn,       // there are bytes, but they are no order
        Unreadable, // the disk does not give them now; they may be good
    };

    // Reads the rows in document order; none unless the state is Whole. A row without a number is passed
    // over.
    static State read(const std::string& folder, std::vector<ArchiveOrder>& rows);
    static State stateOf(const std::string& folder);

    // The rows, or else one for each title file, by name.
    static std::vector<ArchiveOrder> rowsToShow(const std::string& folder);

    // One row for each title file among these, by name.
    static std::vector<ArchiveOrder> rowsByName(const std::vector<std::string>& files);

    // Replaces the order file. On false, with errno, the old one is still there.
    static bool write(const std::string& folder, const std::vector<ArchiveOrder>& rows);

    // As write; rows that the disk refuses are kept, and written when it takes them (RefusedWrites).
    static bool writeOrKeep(const std::string& folder, const std::vector<ArchiveOrder>& rows);

    // Whether rows of this folder are kept that the disk has refused.
    static bool isKept(const std::string& folder);

private:
    static std::string pathIn(const std::string& folder);
    static std::string toBytes(const std::vector<ArchiveOrder>& rows);
};

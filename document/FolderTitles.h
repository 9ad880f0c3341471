// The titles of a folder as its order file lists them, for those who need a few of many titles. The rows are
// read when the object is made, a title each time it is asked for. Never changes, so any thread may read.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

class Archive;

class FolderTitles
{
public:
    // What a folder shows whose order file is missing or cannot be read.
    enum class WithoutOrder { Nothing, ByName };

    // An empty path gives no rows.
    explicit FolderTitles(std::string folder, WithoutOrder withoutOrder = WithoutOrder::Nothing);

    std::size_t count() const { return mNames.size(); }
    // Name of the title file relative to the folder; empty for a blank row.
    const std::string& fileName(std::size_t row) const { return mNames[row]; }
    // Full path of the title file; empty for a blank row.
    std::string path(std::size_t row) const;
    // False for a name that is too short for that of a title file.
    bool canBeTitle(std::size_t row) const;

    // Returns the title with its name and its place in the order. Null when the file is missing or
    // unreadable. A blank row gives an empty title.
    std::unique_ptr<Archive> read(std::size_t row) const;
    // The same for count rows from the first one on, which must exist. Uses all cores; the calling thread
    // takes part.
    std::vector<std::unique_ptr<Archive>> read(std::size_t first, std::size_t count) const;

private:
    std::string mFolder;
    std::vector<std::string> mNames;
};

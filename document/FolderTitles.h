#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

class Archive;

// Reads the titles of a folder in the order of its order file, for users that need only a few of many titles.
// The rows are read by the constructor, each title when it is requested. Immutable, so any thread may read.
class FolderTitles
{
public:
    // Selects what to show if the order file is missing or cannot be read.
    enum class WithoutOrder { Nothing, ByName };

    // An empty path gives no rows.
    explicit FolderTitles(std::string folder, WithoutOrder withoutOrder = WithoutOrder::Nothing);

    std::size_t count() const { return m_names.size(); }
    // Returns the name of the title file relative to the folder; empty for a row without a name.
    const std::string& fileName(std::size_t row) const { return m_names[row]; }
    // Returns the full path of the title file; empty for a row without a name.
    std::string path(std::size_t row) const;
    // Returns false if the name is too short for a title file.
    bool canBeTitle(std::size_t row) const;

    // Returns the title with its name and its position in the order. Null if the file is missing or
    // unreadable. A row without a name gives an empty title.
    std::unique_ptr<Archive> read(std::size_t row) const;
    // Reads count rows beginning with first, all of which must exist. Uses all cores, including the calling
    // thread.
    std::vector<std::unique_ptr<Archive>> read(std::size_t first, std::size_t count) const;

private:
    std::string m_folder;
    std::vector<std::string> m_names;
};

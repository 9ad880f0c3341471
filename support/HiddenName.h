#pragma once

#include <string>
#include <string_view>

// Names of the files that exist only while another file is being saved. They begin with "." and never contain
// ".xml", so that they do not appear in a list of titles.
namespace HiddenName
{

// Returns a new name in the folder for a file that this process is writing or deleting.
std::string temporary(const std::string& folder);

// Returns the name beside path under which its last synced version is kept, or an empty string if that name
// would be too long.
std::string kept(const std::string& path);

// Returns the name of the file that a kept version belongs to, both without folder; empty if name is not the
// name of a kept version.
std::string keptTarget(std::string_view name);

bool isTemporary(std::string_view name);

// Returns whether the process that made a temporary name is still running; true for this process.
bool hasLivingOwner(std::string_view name);

// Returns whether a directory entry has one of these names and is to be ignored as content of its folder.
bool isHidden(std::string_view name);

// Returns the folder of a path, or "." if it has none.
std::string folderOf(const std::string& path);

} // namespace HiddenName

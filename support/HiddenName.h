// Names of the files that exist only while another file is being saved. They begin with "." and never contain
// ".xml", so that no list of titles shows them.
#pragma once

#include <string>
#include <string_view>

namespace HiddenName
{

// A new name in the folder, for a file that is being written or thrown away by this process.
std::string temporary(const std::string& folder);

// The name beside path under which its last version on the disk is kept; empty when that would be too long.
std::string kept(const std::string& path);

// The file in the same folder that a kept name (without folder) stands for; empty when it is no kept name.
std::string keptTarget(std::string_view name);

bool isTemporary(std::string_view name);

// Whether a temporary name belongs to a process that still runs, this one included.
bool hasLivingOwner(std::string_view name);

// Whether a directory entry is one of these, and so no content of its folder.
bool isHidden(std::string_view name);

// Folder of a path, "." when it has none.
std::string folderOf(const std::string& path);

} // namespace HiddenName

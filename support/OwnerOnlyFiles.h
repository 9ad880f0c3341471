#pragma once

#include <sys/stat.h>

// Ensures that only the owner can write the files of this process, whatever umask it was started with.
namespace OwnerOnlyFiles
{

// The permission bits that files and folders never get.
constexpr mode_t REFUSED = S_IWGRP | S_IWOTH;

// Adds REFUSED to the umask of the process. Call first in main.
void setUmask();

} // namespace OwnerOnlyFiles

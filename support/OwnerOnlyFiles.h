// What this process writes can be written by nobody but its owner, whatever umask it was started with.
#pragma once

#include <sys/stat.h>

namespace OwnerOnlyFiles
{

// The permissions that no file or folder gets.
constexpr mode_t REFUSED = S_IWGRP | S_IWOTH;

// Takes these permissions from every file and folder that the process makes from here on. Call first in main.
void setUmask();

} // namespace OwnerOnlyFiles

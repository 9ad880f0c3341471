// The number of files and sockets that this process may have open.
#pragma once

namespace DescriptorLimit
{

// Raises the soft limit to WANTED, or to the hard limit where that is lower; a higher one stays.
void raise();

constexpr unsigned long WANTED = 4096;

} // namespace DescriptorLimit

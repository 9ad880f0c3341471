#pragma once

// Sets the number of files and sockets that this process may have open.
namespace DescriptorLimit
{

// Raises the soft limit to WANTED, or to the hard limit if that is lower. Never lowers it.
void raise();

constexpr unsigned long WANTED = 4096;

} // namespace DescriptorLimit

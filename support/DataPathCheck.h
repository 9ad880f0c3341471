// Whether the appliance's data path can be worked with.
#pragma once

#include <string>

namespace DataPathCheck
{

// The exit code of a program that cannot.
constexpr int EXIT_CODE = 2;
// Bytes of the longest path that fits everywhere.
constexpr std::size_t MAX_LENGTH = 99;

// What is wrong with the data path, in one line without an end; empty when nothing is. Makes the folder of
// the user in it where that is missing.
std::string problem();

} // namespace DataPathCheck

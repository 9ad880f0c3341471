#pragma once

#include <string>

// Checks at start whether the appliance's data path is usable.
namespace DataPathCheck
{

// The exit code of a program whose data path is not usable.
constexpr int EXIT_CODE = 2;
// Length in bytes of the longest data path that every user of it can handle.
constexpr std::size_t MAX_LENGTH = 99;

// Returns what is wrong with the data path as one line without a line feed, or an empty string if it is
// usable. Creates the user's folder in it if that is missing.
std::string problem();

} // namespace DataPathCheck

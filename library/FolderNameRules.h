#pragma once

#include <QString>

// The rules for the name of a title folder.
namespace FolderNameRules
{

// Counted in characters, not in UTF-16 units.
constexpr int LONGEST_NAME = 20;

// Excludes the characters that other systems do not allow either.
inline const QString PATTERN = QStringLiteral("[^][=|/\\\\:;,.*<>?\"]{0,20}$");

bool isTooLong(const QString& name);
// Ignores case, since names that differ only in case would be the same on other systems. Spaces count.
bool isSameName(const QString& first, const QString& second);
// Returns whether the name, which may come from outside, is a plain name that cannot lead out of the root.
bool isFolderName(const QString& name);

} // namespace FolderNameRules

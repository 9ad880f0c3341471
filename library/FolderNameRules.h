// What a title folder may be called.
#pragma once

#include <QString>

namespace FolderNameRules
{

// In characters, not in the units of a QString.
constexpr int LONGEST_NAME = 20;

// The characters that other systems refuse are refused here, too.
inline const QString PATTERN = QStringLiteral("[^][=|/\\\\:;,.*<>?\"]{0,20}$");

bool isTooLong(const QString& name);
// Names that differ in case alone would clash elsewhere. Blanks count.
bool isSameName(const QString& first, const QString& second);
// Whether the name can be that of a folder in the root and nowhere else, whoever gave it.
bool isFolderName(const QString& name);

} // namespace FolderNameRules

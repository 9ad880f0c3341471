#pragma once

#include "document/Archive.h"

#include <QString>

// The titles that the comparison with other programs draws: four texts of one style each on a transparent
// picture, the first with an outline, the second with a shadow. Each stands in three files: as title, as
// title clip for melt, and as SVG.
namespace PeerBatch
{

// Writes the files of titles 0 to count - 1. Returns false when one cannot be written.
bool writeTitles(const QString& folder, int count);

Archive title(const QString& folder, int number);
QString titlePath(const QString& folder, int number);
QString clipPath(const QString& folder, int number);
QString svgPath(const QString& folder, int number);
// Returns the path of one of the pictures that the other programs make: 0 to 3.
QString picturePath(const QString& folder, const QString& program, int number, int picture);

// Make the four pictures of all titles before end, in a process of their own; return its exit code. By this
// program, from the title files, until they are on the disk; and by Qt alone, which leaves outlines and
// shadows out.
int drawOurs(const QString& folder, int first, int end);
int drawByQt(const QString& folder, int first, int end);

} // namespace PeerBatch

#pragma once

#include <QString>
#include <QStringList>

// Finds the names of pictures in source text.
namespace PictureNames
{

// Returns the string literals of C++ source, with adjacent ones joined, except those in comments.
QStringList literals(const QString& source);

// Returns the resource paths in a literal. Each entry is a path (":/A/B"), the beginning of paths (":/A/B_",
// ":/A/") or a path with placeholders (":/A/B_%1"). Lists of slices ("A:B_Rest_Left:B_Rest_Center:...") and
// style sheets (url(:/A/B)) are split. A pattern that consists of placeholders only gives no entry.
QStringList paths(const QString& literal);

// Returns whether the path matches one of the existing paths.
bool exists(const QString& path, const QStringList& existing);

} // namespace PictureNames

#pragma once

#include <QString>
#include <QStringList>

// Finds the names of pictures in source text.
namespace PictureNames
{

// The string literals of C++ source, each run of adjacent ones joined; comments are left out.
QStringList literals(const QString& source);

// What a literal says about resource paths. Each entry is a path (":/A/B"), the beginning of paths (":/A/B_",
// ":/A/") or a path with placeholders (":/A/B_%1"). Lists of slices ("A:B_Rest_Left:B_Rest_Center:...") and
// style sheets (url(:/A/B)) are taken apart. A pattern of nothing but placeholders says nothing.
QStringList paths(const QString& literal);

// Whether one of the existing paths is meant.
bool exists(const QString& path, const QStringList& existing);

} // namespace PictureNames

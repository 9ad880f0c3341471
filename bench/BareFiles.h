#pragma once

#include <QByteArray>
#include <QString>
#include <string>
#include <vector>

// Work with files as the libraries do it by themselves, over all processors. All functions return false when
// a file cannot be read or written.
namespace BareFiles
{

// Parses title files with the XML library.
bool load(const std::vector<std::string>& paths);
// Decodes pictures.
bool decode(const std::vector<std::string>& paths);
// Replaces a file by a new one that was written beside it. Does not wait for the disk.
bool write(const QString& path, const QByteArray& bytes);

// Returns the number of processors that this process may use.
int processors();

} // namespace BareFiles

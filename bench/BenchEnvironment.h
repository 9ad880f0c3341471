#pragma once

#include <QString>
#include <QTemporaryDir>

// The environment of the benchmarks: no display, the build's own fonts, and a temporary folder for all data,
// logs and settings, so that no files of the user are read or written.
class BenchEnvironment
{
public:
    // Sets the environment of this process and its child processes. Make this object before QApplication and
    // before anything of the program is used.
    BenchEnvironment();

    bool isValid() const { return m_folder.isValid(); }
    // Creates an empty folder of this name in the temporary folder. The path ends without "/".
    QString makeFolder(const QString& name) const;

    // Returns the folder of this program and of those built with it.
    static QString binaryFolder();

private:
    QTemporaryDir m_folder;
};

// Where the benchmarks run: no display, the build's own fonts, and a temporary folder for all data, logs and
// settings, so that nothing of the user's is read or written.
#pragma once

#include <QString>
#include <QTemporaryDir>

class BenchEnvironment
{
public:
    // Sets the environment of this process and of those it starts. Before anything of the program is used,
    // and before QApplication is made.
    BenchEnvironment();

    bool isValid() const { return mFolder.isValid(); }
    // An empty folder of that name below the temporary folder; ends without "/".
    QString makeFolder(const QString& name) const;

    // The folder of this program and of those built with it.
    static QString binaryFolder();

private:
    QTemporaryDir mFolder;
};

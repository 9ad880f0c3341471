// The folder picker's work on the disk: the folders under the root of the titles. Has no widgets. Names are
// plain names of folders in the root; one that is none is refused. Results say whether it was done; what
// fails leaves things as they were. GUI thread; nothing here waits for the disk to have written.
#pragma once

#include <QDir>
#include <QFileInfo>
#include <QString>

class FolderPickerController
{
public:
    static const int LIMIT_REMAIN = 200; // with KB_MILLION: kilobytes that must stay free on the disk
    static const int KB_MILLION = 1000;

    // No folder, one that cannot be read, or one without entries.
    bool isNullDirectory(const QFileInfo& folder) const;
    // Whether there is such a folder, and not by a link to a place outside of the root.
    bool isTitleFolder(const QString& root, const QString& name) const;
    // Whether a folder of this name, which need not exist, would be below the root with all links resolved.
    bool staysBelow(const QString& root, const QString& name) const;
    // Without a slash at its end.
    QString getTitlerRootFolder() const;
    // All that a folder holds, with its order. Files that cannot be read are left out, and the result false.
    bool copyFolderFile(const QDir& source, const QDir& target) const;

    bool createFolder(const QString& root, const QString& name) const;
    // False also when another folder or file has the new name.
    bool renameFolder(const QString& root, const QString& oldName, const QString& newName) const;
    // Makes the folder and copies what the source, a full path, holds. False when any of it cannot be copied;
    // the folder is not left half made then.
    bool duplicateFolder(const QString& root, const QString& source, const QString& name) const;

    // Whether less would be free than the limit, the limit included, or that cannot be told. withFolderSize:
    // with another folder like this one.
    bool isDiskFull(const QString& path, bool withFolderSize) const;
};

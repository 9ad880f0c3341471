#pragma once

#include <QDir>
#include <QFileInfo>
#include <QString>

// File operations of the folder picker on the folders under the root of the titles. Has no widgets. Names are
// plain names of folders in the root; others are refused. The functions return whether they succeeded; a
// failed one changes nothing. GUI thread; none of them waits until the disk has synced.
class FolderPickerController
{
public:
    static const int LIMIT_REMAIN = 200; // with KB_MILLION: kilobytes that must stay free on the disk
    static const int KB_MILLION = 1000;

    // Returns whether the folder is missing, unreadable or empty.
    bool isNullDirectory(const QFileInfo& folder) const;
    // Returns whether the folder exists and is not a link to a place outside the root.
    bool isTitleFolder(const QString& root, const QString& name) const;
    // Returns whether a folder of this name, which need not exist, would be below the root after all links
    // are resolved.
    bool staysBelow(const QString& root, const QString& name) const;
    // Returns the root without a slash at its end.
    QString getTitlerRootFolder() const;
    // Copies the contents of a folder and its order file. Leaves out files that cannot be read and returns
    // false then.
    bool copyFolderFile(const QDir& source, const QDir& target) const;

    bool createFolder(const QString& root, const QString& name) const;
    // Returns false also when a folder or file with the new name exists.
    bool renameFolder(const QString& root, const QString& oldName, const QString& newName) const;
    // Creates the folder and copies the contents of the source, a full path. Returns false when any of it
    // cannot be copied; the new folder is removed then.
    bool duplicateFolder(const QString& root, const QString& source, const QString& name) const;

    // Returns whether less free space than the limit would be left, or the space is unknown. withFolderSize:
    // after another folder of this size is made.
    bool isDiskFull(const QString& path, bool withFolderSize) const;
};

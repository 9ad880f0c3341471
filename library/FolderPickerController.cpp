#include "library/FolderPickerController.h"

#include "library/FolderNameRules.h"
#include "support/ConfinedPath.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/SystemInfo.h"

#include <QDirIterator>

bool FolderPickerController::isNullDirectory(const QFileInfo& folder) const
{
    return !folder.isDir() || !QDirIterator(folder.filePath(), QDir::AllEntries | QDir::Hidden |
                                                                   QDir::System | QDir::NoDotAndDotDot)
                                   .hasNext();
}

bool FolderPickerController::isTitleFolder(const QString& root, const QString& name) const
{
    return QFileInfo(root + QLatin1Char('/') + name).isDir() && staysBelow(root, name);
}

bool FolderPickerController::staysBelow(const QString& root, const QString& name) const
{
    return ConfinedPath::isBelow(root.toStdString(), (root + QLatin1Char('/') + name).toStdString());
}

QString FolderPickerController::getTitlerRootFolder() const
{
    const QString path = QString::fromStdWString(FolderLookup::wide(&IPathManagerEx::getTitleResourcesPath));
    return path.isEmpty() ? path : QDir::cleanPath(path);
}

bool FolderPickerController::copyFolderFile(const QDir& source, const QDir& target) const
{
    return SystemInfo::copyFolderFiles(source.path().toStdString(), target.path().toStdString());
}

bool FolderPickerController::createFolder(const QString& root, const QString& name) const
{
    return !root.isEmpty() && FolderNameRules::isFolderName(name) &&
           SystemInfo::createFolders((root + QLatin1Char('/') + name).toStdWString());
}

bool FolderPickerController::renameFolder(const QString& root, const QString& oldName,
                                          const QString& newName) const
{
    return !root.isEmpty() && FolderNameRules::isFolderName(oldName) &&
           FolderNameRules::isFolderName(newName) && oldName != newName &&
           QFileInfo(root + QLatin1Char('/') + oldName).isDir() && QDir(root).rename(oldName, newName);
}

bool FolderPickerController::duplicateFolder(const QString& root, const QString& source,
                                             const QString& name) const
{
    if (!QFileInfo(source).isDir() || !createFolder(root, name))
        return false;
    const QString target = root + QLatin1Char('/') + name;
    if (copyFolderFile(QDir(source), QDir(target)))
        return true;
    QDir(target).removeRecursively(); // no partial copy is kept
    return false;
}

bool FolderPickerController::isDiskFull(const QString& path, bool withFolderSize) const
{
    const std::wstring place = path.toStdWString();
    const long long needed = withFolderSize ? SystemInfo::getFolderSize(place) : 0;
    return SystemInfo::getDiskRemainSize(place) <= needed + LIMIT_REMAIN * KB_MILLION - 1;
}

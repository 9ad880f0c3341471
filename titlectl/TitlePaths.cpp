#include "titlectl/TitlePaths.h"

#include "document/ArchiveManager.h"
#include "document/FolderOrder.h"
#include "document/TitleParserUtility.h"
#include "support/ConfinedPath.h"

#include <QDir>
#include <QFileInfo>
#include <algorithm>

namespace
{

bool hasTitles(const QString& folder)
{
    const std::vector<std::string> files = TitleParserUtility::queryFilesInFolder(folder.toStdString());
    return !files.empty(); // titles or an order file
}

} // namespace

TitlePaths::TitlePaths(const QStringList& paths)
{
    for (const QString& path : paths)
        if (isValid())
            add(QDir::cleanPath(QFileInfo(path).absoluteFilePath()));
}

void TitlePaths::add(const QString& path)
{
    const QFileInfo info(path);
    if (info.isDir() && hasTitles(path)) {
        addFolder(path);
    } else if (info.isDir()) {
        std::vector<std::string> children = TitleParserUtility::queryChildFolders(path.toStdString());
        std::sort(children.begin(), children.end());
        std::erase_if(children,
                      [](const std::string& child) { return !hasTitles(QString::fromStdString(child)); });
        for (const std::string& child : children)
            addFolder(QString::fromStdString(child));
        if (children.empty())
            folder(path).isWhole = true; // a folder without titles
    } else if (info.isFile() && ArchiveManager::isTitleFile(path.toStdString())) {
        addTitle(path);
    } else {
        m_error = info.exists() ? QStringLiteral("%1 is neither a title file nor a folder").arg(path)
                                : QStringLiteral("%1 does not exist").arg(path);
    }
}

void TitlePaths::addTitle(const QString& path)
{
    Folder& place = folder(QFileInfo(path).path());
    if (!place.titles.contains(path))
        place.titles.append(path);
}

void TitlePaths::addFolder(const QString& path)
{
    Folder& place = folder(path);
    place.isWhole = true;
    place.titles = titlesIn(path);
}

TitlePaths::Folder& TitlePaths::folder(const QString& path)
{
    const auto found = std::find_if(m_folders.begin(), m_folders.end(),
                                    [&](const Folder& known) { return known.path == path; });
    if (found != m_folders.end())
        return *found;
    m_folders.append({path, {}, false});
    return m_folders.last();
}

QStringList TitlePaths::titlesIn(const QString& folder)
{
    const std::string path = folder.toStdString();
    QStringList titles;
    for (const ArchiveOrder& row : FolderOrder::rowsToShow(path)) {
        const std::string title = ConfinedPath::namedByOrder(path, row.getArchivePath());
        if (!title.empty() && ArchiveManager::isTitleFile(title))
            titles.append(QString::fromStdString(title));
    }
    return titles;
}

QStringList TitlePaths::folderPaths() const
{
    QStringList paths;
    for (const Folder& place : m_folders)
        paths.append(place.path);
    return paths;
}

QStringList TitlePaths::titles() const
{
    QStringList all;
    for (const Folder& place : m_folders)
        all += place.titles;
    return all;
}

#include "titlectl/CheckedFolder.h"

#include "document/Archive.h"
#include "document/ArchiveManager.h"
#include "document/TitleParser.h"

#include <QDir>
#include <QFileInfo>
#include <algorithm>
#include <utility>
#include <vector>

CheckedFolder::CheckedFolder(QString path) : m_path(std::move(path))
{
    std::vector<ArchiveOrder> rows;
    m_orderState = FolderOrder::read(m_path.toStdString(), rows);
    for (const ArchiveOrder& row : rows)
        m_rows.append(QString::fromStdString(row.getArchivePath()));
    const QStringList entries =
        QDir(m_path).entryList(QDir::Files | QDir::Hidden | QDir::System, QDir::Name); // also broken links
    for (const QString& name : entries)
        if (ArchiveManager::isTitleFile(name.toStdString()))
            m_titleFiles.append(name);
        else
            m_otherFiles.append(name);
    for (const QString& name : std::as_const(m_titleFiles))
        collectNames(name);
}

void CheckedFolder::collectNames(const QString& titleFile)
{
    Archive archive;
    if (TitleParser().readOneTitle(pathOf(titleFile).toStdString(), &archive) != 1) {
        m_unreadableStems.append(QFileInfo(titleFile).completeBaseName() + QLatin1Char('_'));
        return;
    }
    for (const std::string& name :
         {archive.getThumbnailBig(), archive.getThumbnailMiddle(), archive.getThumbnailSmall(),
          archive.getThumbnailBlack(), archive.getBgResource(), archive.getBgResourceBig()})
        m_named.insert(QString::fromStdString(name));
}

bool CheckedFolder::isNamedByTitle(const QString& name) const
{
    return m_named.contains(name) || std::any_of(m_unreadableStems.begin(), m_unreadableStems.end(),
                                                 [&](const QString& stem) { return name.startsWith(stem); });
}

#include "app/RequestedPath.h"

#include "support/ConfinedPath.h"
#include "support/IPathManagerEx.h"

#include <QFileInfo>

namespace
{

bool isBelowTitles(const QString& path)
{
    return ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath, path.toStdString());
}

} // namespace

RequestedPath::RequestedPath(const QString& path) : m_path(path), m_target(find())
{
}

RequestedPath::Target RequestedPath::find() const
{
    if (m_path.isEmpty())
        return Target::Choice;
    const QFileInfo info(m_path);
    if (!info.exists())
        return Target::Missing;
    if (!isBelowTitles(m_path))
        return Target::Outside;
    if (info.isDir())
        return Target::Folder;
    return isBelowTitles(folder()) ? Target::Title : Target::Outside;
}

QString RequestedPath::folder() const
{
    return m_path.left(m_path.lastIndexOf(QLatin1Char('/')));
}

QString RequestedPath::fileName() const
{
    return m_path.mid(m_path.lastIndexOf(QLatin1Char('/')) + 1);
}

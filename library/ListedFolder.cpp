#include "library/ListedFolder.h"

#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/FolderOrder.h"
#include "library/ITitlerFolderReporter.h"
#include "support/ConfinedPath.h"
#include "support/IPathManagerEx.h"

#include <QDir>
#include <vector>

ListedFolder::ListedFolder(ArchiveController& controller) : m_controller(controller)
{
}

QString ListedFolder::name() const
{
    return m_path.section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty);
}

QString ListedFolder::lastUsed() const
{
    const QString last = m_controller.getLastFolderPath();
    const auto folders = m_controller.getFolderList();
    if (!last.isEmpty() && QDir(last).exists() &&
        ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath, last.toStdString()))
        return last;
    return folders.isEmpty() ? QString() : QString::fromStdString(folders.front());
}

void ListedFolder::close()
{
    m_lock.release();
    m_path.clear();
}

void ListedFolder::lock()
{
    m_lock.take(m_path.toStdString(), FolderLock::Kind::Exclusive);
}

void ListedFolder::prepareOrder()
{
    lock();
    m_cleanUp = m_controller.prepareOrder(m_path) ? CleanUp::Allowed : CleanUp::Withheld;
}

void ListedFolder::saveOrder(const QList<ArchiveOrder*>& order, const std::unordered_set<std::string>& known)
{
    if (!m_controller.saveListedOrder(m_path, order, known))
        m_cleanUp = CleanUp::Withheld;
}

bool ListedFolder::isOrderDamaged() const
{
    const std::string folder = m_path.toStdString();
    std::vector<ArchiveOrder> rows;
    return FolderOrder::isKept(folder) || FolderOrder::read(folder, rows) != FolderOrder::State::Whole ||
           rows.empty();
}

void ListedFolder::removeUnlisted()
{
    if (m_cleanUp == CleanUp::Allowed)
        m_controller.deleteUnusefulArchives(m_path);
}

void ListedFolder::reportStart() const
{
    ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
    if (reporter && isOpen())
        reporter->editFolderStartStatus(m_path);
}

void ListedFolder::reportEnd() const
{
    ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
    if (reporter && isOpen())
        reporter->editFolderEndStatus(m_path);
}

void ListedFolder::reportOrder() const
{
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->updateTitlerOrder(m_path);
}

#include "library/ArchiveCheckThread.h"

#include "document/Archive.h"
#include "document/FolderTitles.h"
#include "support/AlternateStack.h"
#include "support/LogManager.h"

#include <QMutexLocker>
#include <algorithm>
#include <string>
#include <utility>

namespace
{

constexpr std::size_t SLICE = 250; // titles checked between two reports

} // namespace

ArchiveCheckThread::ArchiveCheckThread(std::shared_ptr<const FolderTitles> titles, std::size_t first,
                                       QObject* parent)
    : QThread(parent), m_titles(std::move(titles)), m_first(first)
{
}

ArchiveCheckThread::~ArchiveCheckThread()
{
    m_cancelled = true;
    wait();
}

void ArchiveCheckThread::begin()
{
    if (!std::exchange(m_hasBegun, true))
        start(QThread::InheritPriority);
}

QSet<std::size_t> ArchiveCheckThread::takeUnreadable()
{
    QMutexLocker lock(&m_mutex);
    return std::exchange(m_unreadable, {});
}

QSet<std::size_t> ArchiveCheckThread::unreadableIn(std::size_t first, std::size_t count) const
{
    QSet<std::size_t> found;
    for (std::size_t row = first; row < first + count && !m_cancelled; ++row)
        if (!m_titles->read(row))
            found.insert(row);
    return found;
}

void ArchiveCheckThread::run()
{
    AlternateStack::useInThisThread();
    qsizetype unreadable = 0;
    for (std::size_t row = m_first; row < m_titles->count(); row += SLICE) {
        const QSet<std::size_t> found = unreadableIn(row, std::min(SLICE, m_titles->count() - row));
        if (m_cancelled)
            return;
        if (found.isEmpty())
            continue;
        unreadable += found.size();
        {
            QMutexLocker lock(&m_mutex);
            m_unreadable.unite(found);
        }
        Q_EMIT unreadableFound();
    }
    LOG_DEBUG_OPERATE(L"ArchiveList", 200,
                      L"read all " + std::to_wstring(m_titles->count()) + L" titles, " +
                          std::to_wstring(unreadable) + L" of the later ones are unreadable");
}

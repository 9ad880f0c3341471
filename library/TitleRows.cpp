#include "library/TitleRows.h"

#include "document/Archive.h"
#include "document/FolderTitles.h"
#include "library/ArchiveCheckThread.h"
#include "library/ArchiveRow.h"
#include "library/ListMessages.h"

#include <algorithm>
#include <utility>

namespace
{

// Number of titles that are read before the list is shown: as many as an operator can create.
constexpr std::size_t AT_ONCE = ListMessages::TITLE_LIMIT;

} // namespace

TitleRows::TitleRows() = default;
TitleRows::~TitleRows() = default;

std::vector<std::unique_ptr<ScrollViewerRow>> TitleRows::read(ListedTitles& owner, const QString& folder)
{
    const auto titles =
        std::make_shared<const FolderTitles>(folder.toStdString(), FolderTitles::WithoutOrder::ByName);
    std::vector<std::unique_ptr<ScrollViewerRow>> rows;
    rows.reserve(titles->count());
    std::size_t next = 0;
    while (rows.empty() && next < titles->count()) {
        const std::size_t end = std::min(next + AT_ONCE, titles->count());
        for (std::unique_ptr<Archive>& record : titles->read(next, end - next)) {
            if (record)
                rows.push_back(std::make_unique<ArchiveRow>(owner, titles, next, std::move(record)));
            ++next;
        }
    }
    m_readAtOnce = static_cast<int>(rows.size());
    for (std::size_t number = next; number < titles->count(); ++number)
        rows.push_back(std::make_unique<ArchiveRow>(owner, titles, number, nullptr));
    if (next < titles->count()) {
        m_check = std::make_unique<ArchiveCheckThread>(titles, next);
        connect(m_check.get(), &ArchiveCheckThread::unreadableFound, this, &TitleRows::unreadableFound,
                Qt::QueuedConnection);
    }
    return rows;
}

void TitleRows::beginCheck()
{
    if (m_check)
        m_check->begin();
}

void TitleRows::waitForCheck()
{
    if (!m_check)
        return;
    m_check->begin();
    m_check->wait();
}

QSet<std::size_t> TitleRows::takeUnreadable()
{
    return m_check ? m_check->takeUnreadable() : QSet<std::size_t>();
}

void TitleRows::endCheck()
{
    m_check.reset();
}

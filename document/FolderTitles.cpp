#include "document/FolderTitles.h"

#include "document/Archive.h"
#include "document/DocumentConstants.h"
#include "document/FolderOrder.h"
#include "document/TitleParser.h"
#include "support/ConfinedPath.h"

#include <algorithm>
#include <atomic>
#include <future>
#include <thread>
#include <utility>

namespace
{

constexpr std::size_t EXTENSION_LENGTH = 4; // of ".xml"

// Calls job(0) to job(count - 1), each once, and returns when all are done. The calling thread runs jobs,
// too.
template <typename Job>
void onAllCores(std::size_t count, const Job& job)
{
    constexpr std::size_t WORTH_A_THREAD = 8;
    std::atomic<std::size_t> next = 0;
    const auto work = [&] {
        for (std::size_t k = next++; k < count; k = next++)
            job(k);
    };
    const std::size_t cores = std::max(std::thread::hardware_concurrency(), 1U);
    std::vector<std::future<void>> helpers;
    for (std::size_t i = 1; i < std::min(cores, count / WORTH_A_THREAD); ++i)
        helpers.push_back(std::async(std::launch::async, work));
    work();
    for (std::future<void>& helper : helpers)
        helper.get();
}

} // namespace

FolderTitles::FolderTitles(std::string folder, WithoutOrder withoutOrder) : m_folder(std::move(folder))
{
    if (m_folder.empty())
        return;
    std::vector<ArchiveOrder> rows;
    if (withoutOrder == WithoutOrder::ByName)
        rows = FolderOrder::rowsToShow(m_folder);
    else
        FolderOrder::read(m_folder, rows);
    m_names.reserve(rows.size());
    for (const ArchiveOrder& row : rows)
        m_names.push_back(row.getArchivePath());
}

std::string FolderTitles::path(std::size_t row) const
{
    return m_names[row].empty() ? std::string() : m_folder + STR_SLASH + m_names[row];
}

bool FolderTitles::canBeTitle(std::size_t row) const
{
    return m_names[row].empty() || m_names[row].size() >= EXTENSION_LENGTH;
}

std::unique_ptr<Archive> FolderTitles::read(std::size_t row) const
{
    if (!canBeTitle(row))
        return nullptr;
    auto archive = std::make_unique<Archive>();
    const std::string& name = m_names[row];
    if (name.empty())
        return archive;
    archive->setName(name.substr(0, name.size() - EXTENSION_LENGTH));
    archive->setOrder(std::to_string(row + 1));
    const std::string title = ConfinedPath::namedByOrder(m_folder, name);
    if (title.empty() || TitleParser().readOneTitle(title, archive.get()) < 1)
        return nullptr;
    return archive;
}

std::vector<std::unique_ptr<Archive>> FolderTitles::read(std::size_t first, std::size_t count) const
{
    std::vector<std::unique_ptr<Archive>> titles(count);
    onAllCores(count, [&](std::size_t k) { titles[k] = read(first + k); });
    return titles;
}

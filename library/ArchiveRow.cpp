#include "library/ArchiveRow.h"

#include "document/Archive.h"
#include "document/FolderTitles.h"
#include "library/ArchiveItem.h"
#include "library/ListedTitles.h"

#include <utility>

ArchiveRow::ArchiveRow(ListedTitles& owner, std::shared_ptr<const FolderTitles> titles, std::size_t number,
                       std::unique_ptr<Archive> record)
    : m_owner(owner)
    , m_titles(std::move(titles))
    , m_number(number)
    , m_path(m_titles->path(number))
    , m_record(std::move(record))
{
}

ArchiveRow::ArchiveRow(ListedTitles& owner, std::unique_ptr<Archive> record)
    : m_owner(owner), m_path(record->getPath()), m_record(std::move(record))
{
}

ArchiveRow::~ArchiveRow() = default;

QSize ArchiveRow::size() const
{
    return QSize(ArchiveItem::WIDGET_WIDTH, ArchiveItem::WIDGET_HEIGHT);
}

KSBaseItemWidget* ArchiveRow::makeWidget()
{
    return m_owner.makeItem(*this);
}

std::unique_ptr<Archive> ArchiveRow::takeRecord()
{
    if (!m_record && m_titles)
        m_record = m_titles->read(m_number);
    m_isUnreadable = !m_record;
    return std::move(m_record);
}

void ArchiveRow::putBack(std::unique_ptr<Archive> record)
{
    if (!m_titles)
        m_record = std::move(record);
}

#include "library/ArchiveItems.h"

#include "document/Archive.h"
#include "library/ArchiveItem.h"
#include "library/SmallPictures.h"

#include <QStringList>
#include <algorithm>
#include <utility>

ArchiveItems::ArchiveItems(QWidget* list) : m_list(list)
{
}

ArchiveItems::~ArchiveItems() = default;

ArchiveItem* ArchiveItems::make(Archive* record)
{
    auto* item = new ArchiveItem(record, ArchiveItem::LIST_ITEM, m_list);
    m_items.append(item);
    return item;
}

Archive* ArchiveItems::own(std::unique_ptr<Archive> record)
{
    m_records.push_back(std::move(record));
    return m_records.back().get();
}

ArchiveItem* ArchiveItems::find(const QString& path) const
{
    for (ArchiveItem* item : m_items)
        if (item->getArchiveDataPath() == path)
            return item;
    return nullptr;
}

QList<ArchiveItem*> ArchiveItems::beginToComplete()
{
    m_incomplete.clear();
    QStringList paths;
    for (ArchiveItem* item : std::as_const(m_items)) {
        if (item->hasChildWidgets())
            continue;
        m_incomplete.append(item);
        paths.append(item->getArchiveData()->getFullPathOfThumbnailSmall());
    }
    m_pictures.reset();
    if (!paths.isEmpty())
        m_pictures = std::make_unique<SmallPictures>(paths, ArchiveItem::PICTURE_SIZE);
    return m_incomplete;
}

void ArchiveItems::complete(ArchiveItem* item)
{
    if (!m_items.contains(item))
        return;
    const qsizetype place = m_incomplete.indexOf(item);
    if (!item->hasChildWidgets())
        item->initArchiveItemChildWidget(place >= 0 ? m_pictures->take(place) : QImage());
    if (place >= 0 && place == m_incomplete.size() - 1) {
        m_pictures.reset();
        m_incomplete.clear();
    }
}

std::unique_ptr<Archive> ArchiveItems::take(ArchiveItem* item)
{
    m_items.removeOne(item);
    const auto found = std::find_if(m_records.begin(), m_records.end(), [item](const auto& record) {
        return record.get() == item->getArchiveData();
    });
    std::unique_ptr<Archive> record;
    if (found != m_records.end()) {
        record = std::move(*found);
        m_records.erase(found);
    }
    item->discard();
    return record;
}

// Discards the items without deleting them at once: another item may still have to receive the touch event
// that is being delivered.
void ArchiveItems::clear()
{
    m_pictures.reset();
    m_incomplete.clear();
    for (ArchiveItem* item : std::as_const(m_items))
        item->discard();
    m_items.clear();
    m_records.clear();
}

#include "library/ListedTitles.h"

#include "document/Archive.h"
#include "document/ArchiveOrder.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveRow.h"
#include "library/ListMessages.h"
#include "touchui/KSScrollViewerWidget.h"

#include <QFileInfo>
#include <QMetaObject>
#include <QSet>
#include <algorithm>
#include <utility>
#include <vector>

namespace
{

const int MOST_ITEMS = 120; // more titles than operators have in a folder
const int ITEMS_KEPT = 60;  // number to keep when there are more: a few screens on both sides of the view

} // namespace

ListedTitles::ListedTitles(KSScrollViewerWidget& list) : m_list(list), m_items(&list)
{
    connect(&m_list, &KSScrollViewerWidget::signalVisibleItemsChange, this, &ListedTitles::requestGiveBack);
    connect(&m_rows, &TitleRows::unreadableFound, this, &ListedTitles::removeUnreadable);
}

ListedTitles::~ListedTitles()
{
    clear();
}

void ListedTitles::add(const QString& folder)
{
    m_list.addRows(m_rows.read(*this, folder), -1);
}

void ListedTitles::add(const QList<Archive*>& records)
{
    std::vector<std::unique_ptr<ScrollViewerRow>> rows;
    for (Archive* record : records)
        rows.push_back(std::make_unique<ArchiveRow>(*this, std::unique_ptr<Archive>(record)));
    m_list.addRows(std::move(rows), -1);
}

void ListedTitles::clear()
{
    m_rows.endCheck();
    m_list.removeAll();
    m_items.clear();
}

// --- Finding titles -------------------------------------------------------------------------------------

ArchiveRow* ListedTitles::row(int index) const
{
    return static_cast<ArchiveRow*>(m_list.row(index)); // all rows of this list are of this type
}

ArchiveItem* ListedTitles::madeItem(int index) const
{
    return qobject_cast<ArchiveItem*>(m_list.madeWidgetItem(index));
}

ArchiveItem* ListedTitles::item(int index) const
{
    return qobject_cast<ArchiveItem*>(m_list.getWidgetItem(index));
}

// The file of a row may have been deleted since the check.
ArchiveItem* ListedTitles::readableItem(int index)
{
    if (index < 0)
        return nullptr;
    while (!isReadable(index))
        index = qMin(index, m_list.count() - 1);
    return item(index);
}

bool ListedTitles::isReadable(int index)
{
    const ArchiveItem* made = item(index);
    const ArchiveRow* maker = row(index);
    if (!made || !maker || !maker->isUnreadable())
        return true;
    removeUnreadable();
    return false;
}

QString ListedTitles::path(int index) const
{
    if (const ArchiveRow* maker = row(index))
        return QString::fromStdString(maker->path());
    const ArchiveItem* made = madeItem(index);
    return made ? made->getArchiveDataPath() : QString();
}

int ListedTitles::find(const QString& path) const
{
    const std::string wanted = path.toStdString();
    for (int i = 0; i < m_list.count(); ++i) {
        const ArchiveRow* maker = row(i);
        if (maker ? maker->path() == wanted : this->path(i) == path)
            return i;
    }
    return -1;
}

ArchiveItem* ListedTitles::findItem(const QString& path) const
{
    ArchiveItem* made = m_items.find(path);
    return made ? made : item(find(path));
}

QList<ArchiveOrder*> ListedTitles::order() const
{
    QList<ArchiveOrder*> orders;
    for (int i = 0; i < m_list.count(); ++i) {
        auto* order = new ArchiveOrder;
        order->setArchiveIndex(i);
        order->setArchivePath(QFileInfo(path(i)).fileName().toStdString());
        orders.append(order);
    }
    return orders;
}

std::unordered_set<std::string> ListedTitles::fileNames() const
{
    std::unordered_set<std::string> names;
    for (const ArchiveItem* item : m_items.all())
        names.insert(QFileInfo(item->getArchiveDataPath()).fileName().toStdString());
    return names;
}

// --- Making items and giving them back ------------------------------------------------------------------

ArchiveItem* ListedTitles::makeItem(ArchiveRow& row)
{
    std::unique_ptr<Archive> record = row.takeRecord();
    if (!record) {
        // A record without a path is never saved, so the unreadable file is not overwritten.
        record = std::make_unique<Archive>();
        QMetaObject::invokeMethod(this, &ListedTitles::removeUnreadable, Qt::QueuedConnection);
    }
    ArchiveItem* item = makeItem(own(std::move(record)));
    requestContents();
    return item;
}

void ListedTitles::requestContents()
{
    if (!std::exchange(m_contentsRequested, true))
        Q_EMIT contentsRequested();
}

QList<ArchiveItem*> ListedTitles::beginToComplete()
{
    m_contentsRequested = false;
    const QList<ArchiveItem*> incomplete = m_items.beginToComplete();
    beginCheck();
    return incomplete;
}

void ListedTitles::complete(ArchiveItem* item)
{
    m_items.complete(item);
    beginCheck();
}

void ListedTitles::requestGiveBack()
{
    if (m_items.all().size() > MOST_ITEMS && !std::exchange(m_giveBackRequested, true))
        QMetaObject::invokeMethod(this, &ListedTitles::giveBackItems, Qt::QueuedConnection);
}

// Gives back the items farthest from the view. Called after a long folder was scrolled.
void ListedTitles::giveBackItems()
{
    m_giveBackRequested = false;
    std::vector<std::pair<int, ArchiveItem*>> made; // sorted by distance from the view
    for (int i = 0; i < m_list.count(); ++i)
        if (ArchiveItem* item = madeItem(i))
            made.emplace_back(qMax(m_list.firstVisibleItem() - i, i - m_list.lastVisibleItem()), item);
    std::sort(made.begin(), made.end());
    for (; static_cast<qsizetype>(made.size()) > ITEMS_KEPT; made.pop_back()) {
        ArchiveItem* item = made.back().second;
        ArchiveRow* maker = row(m_list.getIndexOfWidgetItem(item));
        if (!item->isHeld() && m_list.giveBackWidgetItem(item))
            maker->putBack(m_items.take(item));
    }
}

// --- Checking the titles of a long folder ---------------------------------------------------------------

int ListedTitles::rowAfterRemoval(int row, const QList<int>& removed)
{
    const auto after = std::lower_bound(removed.cbegin(), removed.cend(), row);
    return row - static_cast<int>(after - removed.cbegin());
}

bool ListedTitles::isFull()
{
    if (m_rows.readAtOnce() < ListMessages::TITLE_LIMIT)
        finishCheck();
    return m_list.count() > ListMessages::TITLE_LIMIT - 1;
}

// Starts the check once the items on screen are complete.
void ListedTitles::beginCheck()
{
    if (m_items.isComplete())
        m_rows.beginCheck();
}

void ListedTitles::finishCheck()
{
    if (!m_rows.isChecking())
        return;
    m_rows.waitForCheck();
    removeUnreadable();
    m_rows.endCheck();
}

// Removes the rows of unreadable titles. A row with an item was read successfully before and stays unless its
// own read failed.
void ListedTitles::removeUnreadable()
{
    const QSet<std::size_t> found = m_rows.takeUnreadable();
    QList<int> gone;
    QList<ArchiveItem*> items;
    for (int i = 0; i < m_list.count(); ++i) {
        const ArchiveRow* maker = row(i);
        ArchiveItem* item = madeItem(i);
        if (!maker || !(maker->isUnreadable() || (!item && found.contains(maker->number()))))
            continue;
        gone.append(i);
        if (item)
            items.append(item);
    }
    if (gone.isEmpty())
        return;
    m_list.removeRows(gone);
    for (ArchiveItem* item : std::as_const(items))
        m_items.take(item);
    Q_EMIT unreadableRemoved(gone);
}

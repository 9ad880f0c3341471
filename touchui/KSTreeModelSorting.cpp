// The orders of rows and columns of the tree model.
#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSModelDataItem.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSVIEW.h"

#include <algorithm>

namespace
{

int sortKindOf(int dataType)
{
    switch (dataType) {
    case KSModelDataFactory::NameDataType:
        return KSTreeModelSortHelper::SortByName;
    case KSModelDataFactory::DateDataType:
        return KSTreeModelSortHelper::SortByDate;
    case KSModelDataFactory::SizeDataType:
        return KSTreeModelSortHelper::SortBySize;
    default:
        return -1;
    }
}

bool isForderItem(KSModelItem* item)
{
    return item->attributes()->getAttribute(KSVIEW::ItemIsForderRole, 0).toBool();
}

} // namespace

void KSTreeModel::sort(int column, Qt::SortOrder order)
{
    m_sortColumn = column < m_columnCount ? column : -1;
    m_sortOrder = order;
    if (m_sortColumn < 0) {
        return;
    }
    Q_EMIT layoutAboutToBeChanged({}, QAbstractItemModel::VerticalSortHint);
    const QModelIndexList before = persistentIndexList();
    sortChildren(m_root.get(), true);
    QModelIndexList after;
    for (const QModelIndex& index : before) {
        after.append(indexOf(itemOf(index), index.column()));
    }
    changePersistentIndexList(before, after);
    Q_EMIT layoutChanged({}, QAbstractItemModel::VerticalSortHint);
}

void KSTreeModel::sortChildren(KSModelItem* item, bool deep)
{
    QList<KSModelItem*> list = item->children(false);
    if (list.isEmpty()) {
        return;
    }
    useSortHelper(m_sortColumn, m_sortOrder, list);
    rankFileAndForder(list, true);
    item->orderChildList(list);
    if (deep) {
        for (KSModelItem* child : std::as_const(list)) {
            sortChildren(child, true);
        }
    }
}

void KSTreeModel::useSortHelper(int column, Qt::SortOrder order, QList<KSModelItem*>& list)
{
    if (m_factory != nullptr) {
        const int dataType = m_factory->getColumnDataType(column);
        m_sortHelper->sortChildList(dataType, sortKindOf(dataType), list, order);
    }
}

void KSTreeModel::rankFileAndForder(QList<KSModelItem*>& list, bool filesFirst)
{
    std::stable_partition(list.begin(), list.end(),
                          [filesFirst](KSModelItem* item) { return isForderItem(item) != filesFirst; });
}

bool KSTreeModel::insertColumns(int column, int count, const QModelIndex& parent)
{
    if (column < 0 || column > m_columnCount || count < 1 || itemOrRoot(parent) == nullptr) {
        return false;
    }
    beginInsertColumns(QModelIndex(), column, column + count - 1);
    changeColumns(column, 0, count);
    endInsertColumns();
    return true;
}

bool KSTreeModel::removeColumns(int column, int count, const QModelIndex& parent)
{
    if (column < 0 || count < 1 || count > m_columnCount - column || itemOrRoot(parent) == nullptr) {
        return false;
    }
    if (column == 0) {
        // The rows below hang on the first column, so nothing of theirs would outlive the signal.
        beginResetModel();
        changeColumns(column, count, 0);
        endResetModel();
        return true;
    }
    beginRemoveColumns(QModelIndex(), column, column + count - 1);
    changeColumns(column, count, 0);
    endRemoveColumns();
    return true;
}

// All rows share the columns, and the signal speaks of the top rows alone: the indices of the rows below are
// moved here.
void KSTreeModel::changeColumns(int column, int removed, int inserted)
{
    QModelIndexList before;
    QModelIndexList after;
    const QModelIndexList persistent = persistentIndexList();
    for (const QModelIndex& index : persistent) {
        if (!index.parent().isValid() || index.column() < column) {
            continue;
        }
        before.append(index);
        const bool gone = index.column() < column + removed;
        after.append(
            gone ? QModelIndex()
                 : createIndex(index.row(), index.column() - removed + inserted, index.internalPointer()));
    }
    changePersistentIndexList(before, after);
    const QList<KSModelItem*> items = m_root->children(true);
    for (KSModelItem* item : items) {
        if (removed > 0) {
            item->attributes()->removeAttributeColumns(column, removed);
        } else {
            item->attributes()->insertAttributeColumns(column, inserted);
        }
    }
    QMap<int, QMap<int, QVariant>> headers;
    for (auto it = m_headerData.cbegin(); it != m_headerData.cend(); ++it) {
        if (it.key() < column) {
            headers.insert(it.key(), it.value());
        } else if (it.key() >= column + removed) {
            headers.insert(it.key() - removed + inserted, it.value());
        }
    }
    m_headerData = headers;
    m_columnCount += inserted - removed;
    m_sortColumn = -1; // it may be another now
}

#include "touchui/KSTreeModel.h"

#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSModelDataItem.h"
#include "touchui/KSModelTreeDataItem.h"
#include "touchui/KSVIEW.h"

#include <QColor>
#include <algorithm>
#include <vector>

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

KSTreeModel::KSTreeModel(KSModelDataFactory* factory, int columnCount, QObject* parent)
    : QAbstractItemModel(parent), m_factory(factory), m_columnCount(std::max(0, columnCount))
{
    installDefaultAttributes();
    createRoot();
}

KSTreeModel::~KSTreeModel() = default;

void KSTreeModel::installDefaultAttributes()
{
    setDefaultAttribute(KSVIEW::ItemEnableRole, true);
    setDefaultAttribute(KSVIEW::ItemEditableRole, false);
    setDefaultAttribute(KSVIEW::ItemIsForderRole, false);
    setDefaultAttribute(KSVIEW::ItemHeightRole, 0);
    setDefaultAttribute(KSVIEW::ItemCheckableRole, false);
    setDefaultAttribute(KSVIEW::ItemSelectableRole, true);
    setDefaultAttribute(KSVIEW::ItemDragEnableRole, false);
    setDefaultAttribute(KSVIEW::ItemDropEnableRole, false);
    setDefaultAttribute(KSVIEW::OnOrPartialChildrenNumberRole, 0);
    setDefaultAttribute(Qt::CheckStateRole, static_cast<int>(Qt::Unchecked));
}

std::unique_ptr<KSModelItem> KSTreeModel::createItem()
{
    return std::make_unique<KSModelTreeDataItem>();
}

void KSTreeModel::createRoot()
{
    m_root = createItem();
    m_root->setRoot(m_root.get());
    m_root->attributes()->setAttribute(KSVIEW::ItemIsForderRole, true, 0);
    m_currentRoot = m_root.get();
}

void KSTreeModel::createDataItems()
{
    beginResetModel();
    createRoot();
    if (m_factory != nullptr)
        m_factory->importSourceData();
    fillChildren(m_root.get());
    endResetModel();
}

int KSTreeModel::createTreeItemChildren(KSModelItem* item)
{
    if (item == nullptr)
        return 0;
    if (!item->dataItem()->isChildrenCreated())
        fillChildren(item);
    return item->childCount();
}

// Rows that were inserted by hand have no source, so they get no children here.
std::vector<std::unique_ptr<KSModelItem>> KSTreeModel::makeChildren(KSModelItem* item)
{
    std::vector<std::unique_ptr<KSModelItem>> children;
    void* source = item->dataItem()->getSourceData();
    if (m_factory == nullptr || (source == nullptr && item != m_root.get()))
        return children;
    const bool checked = item->attributes()->getAttribute(Qt::CheckStateRole, 0).toInt() == Qt::Checked;
    for (void* node = m_factory->getChildNode(source); node != nullptr; node = m_factory->getNextNode(node)) {
        std::unique_ptr<KSModelItem> child = createItem();
        child->dataItem()->setSourceData(node);
        m_factory->InstallItemAttribute(child->attributes(), node);
        if (checked)
            child->attributes()->setAttribute(Qt::CheckStateRole, static_cast<int>(Qt::Checked), 0);
        children.push_back(std::move(child));
    }
    return children;
}

void KSTreeModel::fillChildren(KSModelItem* item)
{
    item->dataItem()->setChildrenCreated(true);
    for (auto& child : makeChildren(item))
        item->addChild(std::move(child));
    if (m_sortColumn >= 0)
        sortChildren(item, false);
}

void KSTreeModel::setSourceData(const QModelIndex& index, void* source)
{
    KSModelItem* item = itemOf(index);
    if (item == nullptr)
        return;
    const QModelIndex first = index.siblingAtColumn(0);
    if (item->childCount() > 0)
        removeRows(0, item->childCount(), first);
    item->dataItem()->setSourceData(source);
    item->dataItem()->setChildrenCreated(true);
    auto children = makeChildren(item);
    if (!children.empty()) {
        beginInsertRows(first, 0, static_cast<int>(children.size()) - 1);
        for (auto& child : children)
            item->addChild(std::move(child));
        if (m_sortColumn >= 0)
            sortChildren(item, false);
        endInsertRows();
    }
}

bool KSTreeModel::isOwnIndex(const QModelIndex& index) const
{
    return index.isValid() && index.model() == this && index.internalPointer() != nullptr;
}

KSModelItem* KSTreeModel::itemOf(const QModelIndex& index) const
{
    return isOwnIndex(index) ? static_cast<KSModelItem*>(index.internalPointer()) : nullptr;
}

KSModelItem* KSTreeModel::itemOrRoot(const QModelIndex& index) const
{
    return index.isValid() ? itemOf(index) : m_currentRoot;
}

QModelIndex KSTreeModel::indexOf(KSModelItem* item, int column) const
{
    if (item == nullptr || item == m_currentRoot || item->parent() == nullptr || column < 0 ||
        column >= m_columnCount)
        return QModelIndex();
    return createIndex(item->parent()->indexOfChildList(item), column, item);
}

void KSTreeModel::setCurrentRoot(const QModelIndex& index)
{
    KSModelItem* item = itemOf(index);
    beginResetModel();
    m_currentRoot = item != nullptr ? item : m_root.get();
    createTreeItemChildren(m_currentRoot);
    endResetModel();
}

void KSTreeModel::setDefaultAttribute(int role, const QVariant& value, int column)
{
    m_defaultAttributes[role].insert(column, value);
}

QVariant KSTreeModel::getDefaultAttribute(int role, int column) const
{
    const QMap<int, QVariant> columns = m_defaultAttributes.value(role);
    return columns.contains(column) ? columns.value(column) : columns.value(-1);
}

QVariant KSTreeModel::getHeaderAttribute(int role) const
{
    return m_headerAttributes.value(role);
}

void KSTreeModel::setHeaderAttribute(int role, const QVariant& value)
{
    m_headerAttributes.insert(role, value);
    if (m_columnCount > 0)
        Q_EMIT headerDataChanged(Qt::Horizontal, 0, m_columnCount - 1);
}

QColor KSTreeModel::getHeaderTextColor(int section) const
{
    return headerData(section, Qt::Horizontal, Qt::ForegroundRole).value<QColor>();
}

bool KSTreeModel::getItemEnable(const QModelIndex& index) const
{
    return data(index, KSVIEW::ItemEnableRole).toBool();
}

bool KSTreeModel::isForder(const QModelIndex& index) const
{
    return data(index.siblingAtColumn(0), KSVIEW::ItemIsForderRole).toBool();
}

bool KSTreeModel::getCheckable(const QModelIndex& index) const
{
    return data(index, KSVIEW::ItemCheckableRole).toBool();
}

bool KSTreeModel::isRecording(const QModelIndex& index) const
{
    return data(index.siblingAtColumn(0), KSVIEW::ItemRecordingRole).toBool();
}

int KSTreeModel::getItemHeight(const QModelIndex& index) const
{
    return std::max(0, data(index.siblingAtColumn(0), KSVIEW::ItemHeightRole).toInt());
}

int KSTreeModel::getOnOrPartialChildrenNumber(const QModelIndex& index) const
{
    return data(index.siblingAtColumn(0), KSVIEW::OnOrPartialChildrenNumberRole).toInt();
}

bool KSTreeModel::areChildrenMade(const QModelIndex& index) const
{
    KSModelItem* item = itemOrRoot(index);
    return item != nullptr && item->dataItem()->isChildrenCreated();
}

QModelIndexList KSTreeModel::madeIndexesWith(int role) const
{
    QModelIndexList found;
    const QList<KSModelItem*> items = m_root->children(true);
    for (KSModelItem* item : items)
        if (item->attributes()->getAttribute(role, 0).toInt() != 0)
            found.append(indexOf(item));
    return found;
}

void KSTreeModel::setAttributeOfAll(int role, const QVariant& value)
{
    const QList<KSModelItem*> items = m_root->children(true);
    for (KSModelItem* item : items) {
        if (!item->attributes()->getAttribute(role, 0).isValid())
            continue;
        item->attributes()->setAttribute(role, value, 0);
        const QModelIndex changed = indexOf(item);
        Q_EMIT dataChanged(changed, changed.siblingAtColumn(m_columnCount - 1), {role});
    }
}

QModelIndex KSTreeModel::index(int row, int column, const QModelIndex& parent) const
{
    if (column < 0 || column >= m_columnCount || row < 0 || row >= rowCount(parent))
        return QModelIndex();
    return createIndex(row, column, itemOrRoot(parent)->child(row));
}

QModelIndex KSTreeModel::parent(const QModelIndex& child) const
{
    KSModelItem* item = itemOf(child);
    return item == nullptr ? QModelIndex() : indexOf(item->parent());
}

int KSTreeModel::rowCount(const QModelIndex& parent) const
{
    // Children are created when their number is first requested. No view has seen the row without children,
    // so no signal is needed.
    return parent.column() > 0 ? 0
                               : const_cast<KSTreeModel*>(this)->createTreeItemChildren(itemOrRoot(parent));
}

int KSTreeModel::columnCount(const QModelIndex&) const
{
    return m_columnCount;
}

bool KSTreeModel::hasChildren(const QModelIndex& parent) const
{
    KSModelItem* item = itemOrRoot(parent);
    if (item == nullptr || parent.column() > 0 || m_columnCount == 0)
        return false;
    if (item->dataItem()->isChildrenCreated())
        return item->childCount() > 0;
    void* source = item->dataItem()->getSourceData();
    return m_factory != nullptr && (source != nullptr || item == m_root.get()) &&
           m_factory->hasChildNode(source);
}

QVariant KSTreeModel::data(const QModelIndex& index, int role) const
{
    KSModelItem* item = itemOf(index);
    if (item == nullptr)
        return QVariant();
    const auto value = [&](int which) {
        const QVariant own = item->attributes()->getAttribute(which, index.column());
        return own.isValid() ? own : getDefaultAttribute(which, index.column());
    };
    if (role == Qt::CheckStateRole && !value(KSVIEW::ItemCheckableRole).toBool())
        return QVariant(); // no check box is drawn for an invalid value
    const QVariant found = value(role);
    return role == Qt::EditRole && !found.isValid() ? value(Qt::DisplayRole) : found;
}

bool KSTreeModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    KSModelItem* item = itemOf(index);
    if (item == nullptr)
        return false;
    QList<int> roles = {role};
    item->attributes()->setAttribute(role, value, index.column());
    if (role == Qt::EditRole) {
        item->attributes()->setAttribute(Qt::DisplayRole, value, index.column());
        roles.append(Qt::DisplayRole);
    }
    const bool shared = item->attributes()->getAttributeMaxKey(role) == 0;
    Q_EMIT dataChanged(shared ? index.siblingAtColumn(0) : index,
                       shared ? index.siblingAtColumn(m_columnCount - 1) : index, roles);
    return true;
}

QVariant KSTreeModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || section < 0 || section >= m_columnCount)
        return QVariant();
    const QVariant own = m_headerData.value(section).value(role);
    return own.isValid() ? own : getHeaderAttribute(role);
}

bool KSTreeModel::setHeaderData(int section, Qt::Orientation orientation, const QVariant& value, int role)
{
    if (orientation != Qt::Horizontal || section < 0 || section >= m_columnCount)
        return false;
    m_headerData[section].insert(role == Qt::EditRole ? static_cast<int>(Qt::DisplayRole) : role, value);
    Q_EMIT headerDataChanged(orientation, section, section);
    return true;
}

Qt::ItemFlags KSTreeModel::flags(const QModelIndex& index) const
{
    if (itemOf(index) == nullptr)
        return Qt::NoItemFlags;
    const auto has = [&](int role) { return data(index, role).toBool(); };
    Qt::ItemFlags flags = Qt::NoItemFlags;
    flags.setFlag(Qt::ItemIsEnabled, has(KSVIEW::ItemEnableRole));
    flags.setFlag(Qt::ItemIsSelectable, has(KSVIEW::ItemSelectableRole));
    flags.setFlag(Qt::ItemIsEditable, has(KSVIEW::ItemEditableRole));
    flags.setFlag(Qt::ItemIsUserCheckable, has(KSVIEW::ItemCheckableRole));
    flags.setFlag(Qt::ItemIsDragEnabled, has(KSVIEW::ItemDragEnableRole));
    flags.setFlag(Qt::ItemIsDropEnabled, has(KSVIEW::ItemDropEnableRole));
    return flags;
}

bool KSTreeModel::insertRows(int row, int count, const QModelIndex& parent)
{
    KSModelItem* item = itemOrRoot(parent);
    if (item == nullptr || count < 1 || row < 0 || row > rowCount(parent))
        return false;
    beginInsertRows(parent, row, row + count - 1);
    for (int i = 0; i < count; ++i)
        item->addChild(createItem(), row + i);
    endInsertRows();
    return true;
}

bool KSTreeModel::removeRows(int row, int count, const QModelIndex& parent)
{
    KSModelItem* item = itemOrRoot(parent);
    if (item == nullptr || count < 1 || row < 0 || count > rowCount(parent) - row)
        return false;
    beginRemoveRows(parent, row, row + count - 1);
    // destroyed after endRemoveRows(), when no index refers to them
    std::vector<std::unique_ptr<KSModelItem>> removed;
    for (int i = 0; i < count; ++i)
        removed.push_back(item->remove(row));
    endRemoveRows();
    return true;
}

bool KSTreeModel::moveRows(const QModelIndex& sourceParent, int sourceRow, int count,
                           const QModelIndex& destinationParent, int destinationChild)
{
    KSModelItem* from = itemOrRoot(sourceParent);
    KSModelItem* to = itemOrRoot(destinationParent);
    if (from == nullptr || to == nullptr || count < 1 || sourceRow < 0 ||
        count > rowCount(sourceParent) - sourceRow || destinationChild < 0 ||
        destinationChild > rowCount(destinationParent) ||
        !beginMoveRows(sourceParent, sourceRow, sourceRow + count - 1, destinationParent, destinationChild))
        return false;
    std::vector<std::unique_ptr<KSModelItem>> taken;
    for (int i = 0; i < count; ++i)
        taken.push_back(from->remove(sourceRow));
    int row = destinationChild;
    if (from == to && destinationChild > sourceRow)
        row -= count; // removing the rows has moved the destination
    for (auto& item : taken)
        to->addChild(std::move(item), row++);
    endMoveRows();
    return true;
}

void KSTreeModel::sort(int column, Qt::SortOrder order)
{
    m_sortColumn = column < m_columnCount ? column : -1;
    m_sortOrder = order;
    if (m_sortColumn < 0)
        return;
    Q_EMIT layoutAboutToBeChanged({}, QAbstractItemModel::VerticalSortHint);
    const QModelIndexList before = persistentIndexList();
    sortChildren(m_root.get(), true);
    QModelIndexList after;
    for (const QModelIndex& index : before)
        after.append(indexOf(itemOf(index), index.column()));
    changePersistentIndexList(before, after);
    Q_EMIT layoutChanged({}, QAbstractItemModel::VerticalSortHint);
}

void KSTreeModel::sortChildren(KSModelItem* item, bool deep)
{
    QList<KSModelItem*> list = item->children(false);
    if (list.isEmpty())
        return;
    useSortHelper(m_sortColumn, m_sortOrder, list);
    rankFileAndForder(list, true);
    item->orderChildList(list);
    if (deep)
        for (KSModelItem* child : std::as_const(list))
            sortChildren(child, true);
}

void KSTreeModel::useSortHelper(int column, Qt::SortOrder order, QList<KSModelItem*>& list)
{
    if (m_factory != nullptr) {
        const int dataType = m_factory->getColumnDataType(column);
        m_sortHelper.sortChildList(dataType, sortKindOf(dataType), list, order);
    }
}

void KSTreeModel::rankFileAndForder(QList<KSModelItem*>& list, bool filesFirst)
{
    std::stable_partition(list.begin(), list.end(),
                          [filesFirst](KSModelItem* item) { return isForderItem(item) != filesFirst; });
}

bool KSTreeModel::insertColumns(int column, int count, const QModelIndex& parent)
{
    if (column < 0 || column > m_columnCount || count < 1 || itemOrRoot(parent) == nullptr)
        return false;
    beginInsertColumns(QModelIndex(), column, column + count - 1);
    changeColumns(column, 0, count);
    endInsertColumns();
    return true;
}

bool KSTreeModel::removeColumns(int column, int count, const QModelIndex& parent)
{
    if (column < 0 || count < 1 || count > m_columnCount - column || itemOrRoot(parent) == nullptr)
        return false;
    if (column == 0) {
        // The rows below are children of the first column, so their indices do not survive. Reset the model.
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

// All rows have the same columns, but the signal concerns only the top rows, so the persistent indices of the
// rows below are moved here.
void KSTreeModel::changeColumns(int column, int removed, int inserted)
{
    QModelIndexList before;
    QModelIndexList after;
    const QModelIndexList persistent = persistentIndexList();
    for (const QModelIndex& index : persistent) {
        if (!index.parent().isValid() || index.column() < column)
            continue;
        before.append(index);
        const bool gone = index.column() < column + removed;
        after.append(
            gone ? QModelIndex()
                 : createIndex(index.row(), index.column() - removed + inserted, index.internalPointer()));
    }
    changePersistentIndexList(before, after);
    const QList<KSModelItem*> items = m_root->children(true);
    for (KSModelItem* item : items)
        if (removed > 0)
            item->attributes()->removeAttributeColumns(column, removed);
        else
            item->attributes()->insertAttributeColumns(column, inserted);
    QMap<int, QMap<int, QVariant>> headers;
    for (auto it = m_headerData.cbegin(); it != m_headerData.cend(); ++it)
        if (it.key() < column)
            headers.insert(it.key(), it.value());
        else if (it.key() >= column + removed)
            headers.insert(it.key() - removed + inserted, it.value());
    m_headerData = headers;
    m_columnCount += inserted - removed;
    m_sortColumn = -1; // the sort column may have moved
}

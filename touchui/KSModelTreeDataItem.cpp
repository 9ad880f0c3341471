#include "touchui/KSModelTreeDataItem.h"

#include <algorithm>

void KSModelTreeDataItem::setRoot(KSModelItem* root)
{
    m_root = root;
    for (const auto& child : m_children)
        child->setRoot(root);
}

KSModelItem* KSModelTreeDataItem::child(int row) const
{
    return row >= 0 && row < childCount() ? m_children[static_cast<size_t>(row)].get() : nullptr;
}

QList<KSModelItem*> KSModelTreeDataItem::children(bool deep) const
{
    QList<KSModelItem*> list;
    for (const auto& child : m_children) {
        list.append(child.get());
        if (deep)
            list.append(child->children(true));
    }
    return list;
}

KSModelItem* KSModelTreeDataItem::sibling(int distance) const
{
    return m_parent == nullptr ? nullptr : m_parent->child(m_parent->indexOfChildList(this) + distance);
}

KSModelItem* KSModelTreeDataItem::insertNext(std::unique_ptr<KSModelItem> item)
{
    return m_parent == nullptr ? nullptr
                               : m_parent->addChild(std::move(item), m_parent->indexOfChildList(this) + 1);
}

KSModelItem* KSModelTreeDataItem::insertPrev(std::unique_ptr<KSModelItem> item)
{
    return m_parent == nullptr ? nullptr
                               : m_parent->addChild(std::move(item), m_parent->indexOfChildList(this));
}

KSModelItem* KSModelTreeDataItem::addChild(std::unique_ptr<KSModelItem> item, int row)
{
    if (item == nullptr)
        return nullptr;
    KSModelItem* added = item.get();
    added->setParent(this);
    added->setRoot(m_root);
    const int at = row < 0 || row > childCount() ? childCount() : row;
    m_children.insert(m_children.begin() + at, std::move(item));
    return added;
}

std::unique_ptr<KSModelItem> KSModelTreeDataItem::remove(int row)
{
    if (row < 0 || row >= childCount())
        return nullptr;
    const auto at = m_children.begin() + row;
    std::unique_ptr<KSModelItem> taken = std::move(*at);
    m_children.erase(at);
    taken->setParent(nullptr);
    taken->setRoot(nullptr);
    return taken;
}

std::unique_ptr<KSModelItem> KSModelTreeDataItem::removeSeft()
{
    return m_parent == nullptr ? nullptr : m_parent->remove(m_parent->indexOfChildList(this));
}

int KSModelTreeDataItem::indexOfChildList(const KSModelItem* item) const
{
    // A view asks for the rows in order, so begin where the last search ended.
    for (size_t ahead = 0; ahead < m_children.size(); ++ahead) {
        const size_t row = (m_lastFound + ahead) % m_children.size();
        if (m_children[row].get() == item) {
            m_lastFound = row;
            return static_cast<int>(row);
        }
    }
    return -1;
}

bool KSModelTreeDataItem::orderChildList(const QList<KSModelItem*>& order)
{
    if (order.size() != childCount())
        return false;
    QHash<KSModelItem*, size_t> rows;
    for (size_t row = 0; row < m_children.size(); ++row)
        rows.insert(m_children[row].get(), row);
    std::vector<size_t> places;
    for (KSModelItem* item : order) {
        const auto found = rows.constFind(item);
        if (found == rows.constEnd())
            return false;
        places.push_back(*found);
        rows.erase(found);
    }
    std::vector<std::unique_ptr<KSModelItem>> ordered;
    for (const size_t place : places)
        ordered.push_back(std::move(m_children[place]));
    m_children = std::move(ordered);
    return true;
}

QVariant KSModelTreeDataItem::getAttribute(int role, int column) const
{
    const auto found = m_attributes.constFind(role);
    if (found == m_attributes.constEnd() || column < 0)
        return QVariant();
    if (found->size() == 1)
        return found->constFirst();
    return column < found->size() ? found->at(column) : QVariant();
}

void KSModelTreeDataItem::setAttribute(int role, const QVariant& value, int column)
{
    if (column < 0)
        return;
    QList<QVariant>& values = m_attributes[role];
    if (values.isEmpty())
        values.resize(1);
    if (values.size() == 1)
        values[0] = value;
    else if (column < values.size())
        values[column] = value;
}

void KSModelTreeDataItem::setAttributeMaxKey(int role, int maxColumn)
{
    m_attributes[role].resize(std::max(0, maxColumn) + 1);
}

int KSModelTreeDataItem::getAttributeMaxKey(int role) const
{
    const auto found = m_attributes.constFind(role);
    return found == m_attributes.constEnd() ? 0 : static_cast<int>(found->size()) - 1;
}

void KSModelTreeDataItem::insertAttributeColumns(int column, int count)
{
    for (QList<QVariant>& values : m_attributes)
        if (values.size() > 1 && column >= 0 && column <= values.size())
            values.insert(column, count, QVariant());
}

void KSModelTreeDataItem::removeAttributeColumns(int column, int count)
{
    for (QList<QVariant>& values : m_attributes) {
        if (values.size() > 1 && column >= 0 && column < values.size()) {
            values.remove(column, std::min<qsizetype>(count, values.size() - column));
            if (values.isEmpty())
                values.resize(1);
        }
    }
}

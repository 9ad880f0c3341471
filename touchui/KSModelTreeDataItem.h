#pragma once

#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSModelDataItem.h"
#include "touchui/KSModelItem.h"

#include <QHash>
#include <vector>

// The node class of KSTreeModel.
class KSModelTreeDataItem : public KSModelItem, public KSModelDataItem, public KSModelAttributeItem
{
public:
    KSModelTreeDataItem() = default;
    KSModelTreeDataItem(const KSModelTreeDataItem&) = delete;
    KSModelTreeDataItem& operator=(const KSModelTreeDataItem&) = delete;

    KSModelItemType type() const override { return TreeDataItem; }
    KSModelAttributeItem* attributes() override { return this; }
    KSModelDataItem* dataItem() override { return this; }

    KSModelItem* root() const override { return m_root; }
    void setRoot(KSModelItem* root) override;
    KSModelItem* parent() const override { return m_parent; }
    void setParent(KSModelItem* parent) override { m_parent = parent; }
    KSModelItem* child(int row) const override;
    int childCount() const override { return static_cast<int>(m_children.size()); }
    QList<KSModelItem*> children(bool deep) const override;
    KSModelItem* next() const override { return sibling(1); }
    KSModelItem* prev() const override { return sibling(-1); }
    KSModelItem* insertNext(std::unique_ptr<KSModelItem> item) override;
    KSModelItem* insertPrev(std::unique_ptr<KSModelItem> item) override;
    KSModelItem* addChild(std::unique_ptr<KSModelItem> item, int row = -1) override;
    std::unique_ptr<KSModelItem> remove(int row) override;
    std::unique_ptr<KSModelItem> removeSeft() override;
    int indexOfChildList(const KSModelItem* item) const override;
    bool orderChildList(const QList<KSModelItem*>& order) override;

    void* getSourceData() const override { return m_sourceData; }
    void setSourceData(void* data) override { m_sourceData = data; }
    bool isChildrenCreated() const override { return m_childrenCreated; }
    void setChildrenCreated(bool created) override { m_childrenCreated = created; }

    QVariant getAttribute(int role, int column) const override;
    void setAttribute(int role, const QVariant& value, int column) override;
    void setAttributeMaxKey(int role, int maxColumn) override;
    int getAttributeMaxKey(int role) const override;
    void insertAttributeColumns(int column, int count) override;
    void removeAttributeColumns(int column, int count) override;

private:
    KSModelItem* sibling(int distance) const;

    KSModelItem* m_root = nullptr;
    KSModelItem* m_parent = nullptr;
    std::vector<std::unique_ptr<KSModelItem>> m_children;
    mutable size_t m_lastFound = 0; // row of the last result of indexOfChildList()
    void* m_sourceData = nullptr;
    bool m_childrenCreated = false;
    QHash<int, QList<QVariant>> m_attributes; // key: role; a list has max key + 1 values
};

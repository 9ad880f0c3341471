#pragma once

#include <QList>
#include <memory>

class KSModelAttributeItem;
class KSModelDataItem;

// One node of a tree with links to its parent, children and siblings. A node owns its children.
class KSModelItem
{
public:
    enum KSModelItemType { TreeDataItem = 0 };

    virtual ~KSModelItem() = default;

    virtual KSModelItemType type() const = 0;
    virtual KSModelAttributeItem* attributes() = 0;
    virtual KSModelDataItem* dataItem() = 0;

    virtual KSModelItem* root() const = 0;
    // Sets the root of this node and of all nodes below it.
    virtual void setRoot(KSModelItem* root) = 0;
    virtual KSModelItem* parent() const = 0;
    // Sets only the link; addChild and the other functions call it themselves.
    virtual void setParent(KSModelItem* parent) = 0;

    // Returns null if there is no such row.
    virtual KSModelItem* child(int row) const = 0;
    virtual int childCount() const = 0;
    // If deep is true, includes all descendants, each after its parent.
    virtual QList<KSModelItem*> children(bool deep) const = 0;
    virtual KSModelItem* next() const = 0;
    virtual KSModelItem* prev() const = 0;

    // Insert the item after or before this node. If this node has no parent, they delete the item and return
    // null.
    virtual KSModelItem* insertNext(std::unique_ptr<KSModelItem> item) = 0;
    virtual KSModelItem* insertPrev(std::unique_ptr<KSModelItem> item) = 0;
    // Appends the item if there is no such row. Null is ignored.
    virtual KSModelItem* addChild(std::unique_ptr<KSModelItem> item, int row = -1) = 0;
    // Removes and returns a child; null if there is no such row.
    virtual std::unique_ptr<KSModelItem> remove(int row) = 0;
    // Removes this node from its parent and returns it; null without a parent.
    virtual std::unique_ptr<KSModelItem> removeSeft() = 0;
    // Returns -1 if the item is not a child of this node.
    virtual int indexOfChildList(const KSModelItem* item) const = 0;
    // Reorders the children. order must contain each child exactly once; otherwise nothing changes and false
    // is returned.
    virtual bool orderChildList(const QList<KSModelItem*>& order) = 0;
};

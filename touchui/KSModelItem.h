#pragma once

#include <QList>
#include <memory>

class KSModelAttributeItem;
class KSModelDataItem;

// One node of a tree, with its links up, down and to both sides. A node owns its children.
class KSModelItem
{
public:
    enum KSModelItemType { TreeDataItem = 0 };

    virtual ~KSModelItem() = default;

    virtual KSModelItemType type() const = 0;
    virtual KSModelAttributeItem* attributes() = 0;
    virtual KSModelDataItem* dataItem() = 0;

    virtual KSModelItem* root() const = 0;
    // Of this node and all below it.
    virtual void setRoot(KSModelItem* root) = 0;
    virtual KSModelItem* parent() const = 0;
    // The link alone; addChild and the others keep it by themselves.
    virtual void setParent(KSModelItem* parent) = 0;

    // Null outside the list.
    virtual KSModelItem* child(int row) const = 0;
    virtual int childCount() const = 0;
    // deep: also the children's children, each behind its parent.
    virtual QList<KSModelItem*> children(bool deep) const = 0;
    virtual KSModelItem* next() const = 0;
    virtual KSModelItem* prev() const = 0;

    // Beside this node, which must have a parent; without one the item is deleted and null given back.
    virtual KSModelItem* insertNext(std::unique_ptr<KSModelItem> item) = 0;
    virtual KSModelItem* insertPrev(std::unique_ptr<KSModelItem> item) = 0;
    // A row outside the list appends. Null is ignored.
    virtual KSModelItem* addChild(std::unique_ptr<KSModelItem> item, int row = -1) = 0;
    // Takes a child out; null outside the list.
    virtual std::unique_ptr<KSModelItem> remove(int row) = 0;
    // Takes this node out of its parent; null without one.
    virtual std::unique_ptr<KSModelItem> removeSeft() = 0;
    // -1 for a stranger.
    virtual int indexOfChildList(const KSModelItem* item) const = 0;
    // Puts the children in this order, which must hold each of them once; false and no change otherwise.
    virtual bool orderChildList(const QList<KSModelItem*>& order) = 0;
};

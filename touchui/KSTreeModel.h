#pragma once

#include "touchui/KSModelDataFactory.h"
#include "touchui/KSModelItem.h"
#include "touchui/KSTreeModelSortHelper.h"

#include <QAbstractItemModel>
#include <QMap>
#include <memory>
#include <vector>

// A tree without a schema: every cell is a bag of attributes by role, filled by a KSModelDataFactory. The
// children of a row are made when they are first asked for; whether there are any is known without making
// them.
//
// The model owns its items. Indices that are invalid or of another model give empty values and change
// nothing. GUI thread only.
class KSTreeModel : public QAbstractItemModel
{
    Q_OBJECT
public:
    // The factory is not owned and outlives the model; may be null for a tree that is filled by hand.
    explicit KSTreeModel(KSModelDataFactory* factory, int columnCount, QObject* parent = nullptr);
    ~KSTreeModel() override;

    KSModelDataFactory* factory() const { return m_factory; }
    KSModelItem::KSModelItemType itemType() const { return m_itemType; }

    // Drops all items, reads the source and makes the top rows.
    void createDataItems();
    // Makes the children of the item unless they are there; the number of children.
    int createTreeItemChildren(KSModelItem* item);

    // Lets the row stand for another node of the source, and makes its children anew from that. Its own
    // attributes stay.
    void setSourceData(const QModelIndex& index, void* source);

    // The item whose children are the top rows; the root at first.
    KSModelItem* currentRoot() const { return m_currentRoot; }
    // An invalid index goes back to the root.
    void setCurrentRoot(const QModelIndex& index);
    // Null for an index that is invalid or not of this model.
    KSModelItem* itemOf(const QModelIndex& index) const;
    QModelIndex indexOf(KSModelItem* item, int column = 0) const;

    // What a cell has that its item does not say. A role's value for column -1 is that of all columns.
    void setDefaultAttribute(int role, const QVariant& value, int column = -1);
    QVariant getDefaultAttribute(int role, int column) const;

    // What all header sections share; setHeaderData goes before it.
    QVariant getHeaderAttribute(int role) const;
    void setHeaderAttribute(int role, const QVariant& value);
    // Invalid when none was set.
    QColor getHeaderTextColor(int section) const;

    bool getItemEnable(const QModelIndex& index) const;
    bool isForder(const QModelIndex& index) const;
    bool getCheckable(const QModelIndex& index) const;
    bool isRecording(const QModelIndex& index) const;
    // 0 when the view shall choose.
    int getItemHeight(const QModelIndex& index) const;
    int getOnOrPartialChildrenNumber(const QModelIndex& index) const;
    // False while nobody has asked for the children of the row.
    bool areChildrenMade(const QModelIndex& index) const;
    // The rows that have been made and whose role holds a number other than 0 or true.
    QModelIndexList madeIndexesWith(int role) const;
    // Sets the role of every item that has been made and has a value.
    void setAttributeOfAll(int role, const QVariant& value);

    // Owned from now on. At first there is a KSTreeModelDefaultSortHelper.
    void setSortHelper(std::unique_ptr<KSTreeModelSortHelper> helper);
    // Files, or folders, to the front; each group keeps its order.
    static void rankFileAndForder(QList<KSModelItem*>& list, bool filesFirst);

    QModelIndex index(int row, int column, const QModelIndex& parent = QModelIndex()) const override;
    QModelIndex parent(const QModelIndex& child) const override;
    using QObject::parent;
    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    int columnCount(const QModelIndex& parent = QModelIndex()) const override;
    bool hasChildren(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    // Any role is taken; the edit role is also the display role.
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    bool setHeaderData(int section, Qt::Orientation orientation, const QVariant& value,
                       int role = Qt::EditRole) override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    bool insertRows(int row, int count, const QModelIndex& parent = QModelIndex()) override;
    bool removeRows(int row, int count, const QModelIndex& parent = QModelIndex()) override;
    bool moveRows(const QModelIndex& sourceParent, int sourceRow, int count,
                  const QModelIndex& destinationParent, int destinationChild) override;
    bool insertColumns(int column, int count, const QModelIndex& parent = QModelIndex()) override;
    bool removeColumns(int column, int count, const QModelIndex& parent = QModelIndex()) override;
    // Sorts every list that has been made, and those that are made later. A column below 0 ends that and
    // leaves the rows as they stand.
    void sort(int column, Qt::SortOrder order = Qt::AscendingOrder) override;

protected:
    virtual std::unique_ptr<KSModelItem> createItem();
    // Sorts one child list by the type of the column.
    virtual void useSortHelper(int column, Qt::SortOrder order, QList<KSModelItem*>& list);

private:
    void installDefaultAttributes();
    void createRoot();
    void fillChildren(KSModelItem* item);
    std::vector<std::unique_ptr<KSModelItem>> makeChildren(KSModelItem* item);
    void sortChildren(KSModelItem* item, bool deep);
    KSModelItem* itemOrRoot(const QModelIndex& index) const;
    bool isOwnIndex(const QModelIndex& index) const;
    void changeColumns(int column, int removed, int inserted);

    KSModelDataFactory* m_factory;
    std::unique_ptr<KSTreeModelSortHelper> m_sortHelper;
    std::unique_ptr<KSModelItem> m_root;
    KSModelItem* m_currentRoot = nullptr;
    KSModelItem::KSModelItemType m_itemType = KSModelItem::TreeDataItem;
    int m_columnCount;
    QMap<int, QMap<int, QVariant>> m_defaultAttributes; // role, column
    QMap<int, QVariant> m_headerAttributes;             // by role, of all sections
    QMap<int, QMap<int, QVariant>> m_headerData;        // section, role
    int m_sortColumn = -1;
    Qt::SortOrder m_sortOrder = Qt::AscendingOrder;
};

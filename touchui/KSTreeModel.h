#pragma once

#include "touchui/KSModelDataFactory.h"
#include "touchui/KSModelItem.h"
#include "touchui/KSTreeModelDefaultSortHelper.h"

#include <QAbstractItemModel>
#include <QMap>
#include <memory>
#include <vector>

// A tree model without a fixed schema: every cell has attributes by role, which a KSModelDataFactory
// provides. The children of a row are created when they are first needed; whether a row has children is known
// without creating them.
//
// The model owns its items. Indices that are invalid or belong to another model give empty values and change
// nothing. GUI thread only.
class KSTreeModel : public QAbstractItemModel
{
    Q_OBJECT
public:
    // The factory is not owned and must outlive the model; it may be null for a tree that is filled by hand.
    explicit KSTreeModel(KSModelDataFactory* factory, int columnCount, QObject* parent = nullptr);
    ~KSTreeModel() override;

    KSModelDataFactory* factory() const { return m_factory; }

    // Removes all items, reads the source and creates the top rows.
    void createDataItems();
    // Creates the children of the item unless they exist; returns their number.
    int createTreeItemChildren(KSModelItem* item);

    // Assigns another node of the source to the row and creates its children from that. The attributes of the
    // row do not change.
    void setSourceData(const QModelIndex& index, void* source);

    // The item whose children are the top rows; initially the root.
    KSModelItem* currentRoot() const { return m_currentRoot; }
    // An invalid index restores the root.
    void setCurrentRoot(const QModelIndex& index);
    // Returns null for an index that is invalid or belongs to another model.
    KSModelItem* itemOf(const QModelIndex& index) const;
    QModelIndex indexOf(KSModelItem* item, int column = 0) const;

    // Sets the value of a role for cells whose item has none. Column -1 stands for all columns.
    void setDefaultAttribute(int role, const QVariant& value, int column = -1);
    QVariant getDefaultAttribute(int role, int column) const;

    // A value for all header sections; one that was set with setHeaderData takes precedence.
    QVariant getHeaderAttribute(int role) const;
    void setHeaderAttribute(int role, const QVariant& value);
    // Returns an invalid colour if none was set.
    QColor getHeaderTextColor(int section) const;

    bool getItemEnable(const QModelIndex& index) const;
    bool isForder(const QModelIndex& index) const;
    bool getCheckable(const QModelIndex& index) const;
    bool isRecording(const QModelIndex& index) const;
    // Returns 0 if the view chooses the height.
    int getItemHeight(const QModelIndex& index) const;
    int getOnOrPartialChildrenNumber(const QModelIndex& index) const;
    // Returns false until the children of the row are requested.
    bool areChildrenMade(const QModelIndex& index) const;
    // Returns the existing rows whose value for role is a number other than 0, or true.
    QModelIndexList madeIndexesWith(int role) const;
    // Sets the role of every existing item that has a value for it.
    void setAttributeOfAll(int role, const QVariant& value);

    // Moves files, or folders, to the front; the order within each group is kept.
    static void rankFileAndForder(QList<KSModelItem*>& list, bool filesFirst);

    QModelIndex index(int row, int column, const QModelIndex& parent = QModelIndex()) const override;
    QModelIndex parent(const QModelIndex& child) const override;
    using QObject::parent;
    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    int columnCount(const QModelIndex& parent = QModelIndex()) const override;
    bool hasChildren(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    // Accepts any role; the edit role also sets the display role.
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
    // Sorts all existing child lists, and those that are created later. A negative column turns sorting off
    // and leaves the rows unchanged.
    void sort(int column, Qt::SortOrder order = Qt::AscendingOrder) override;

protected:
    virtual std::unique_ptr<KSModelItem> createItem();
    // Sorts one child list by the data type of the column.
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
    KSTreeModelDefaultSortHelper m_sortHelper;
    std::unique_ptr<KSModelItem> m_root;
    KSModelItem* m_currentRoot = nullptr;
    int m_columnCount;
    QMap<int, QMap<int, QVariant>> m_defaultAttributes; // keys: role, column
    QMap<int, QVariant> m_headerAttributes;             // key: role
    QMap<int, QMap<int, QVariant>> m_headerData;        // keys: section, role
    int m_sortColumn = -1;
    Qt::SortOrder m_sortOrder = Qt::AscendingOrder;
};

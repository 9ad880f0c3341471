#pragma once

#include <QMap>
#include <QObject>

class KSModelAttributeItem;
class KSModelItem;
class QModelIndex;
class QWidget;

// Provides a KSTreeModel with its content by iterating over the nodes of a source. A node is an opaque handle
// of the factory; the model stores it and passes it back, but does not dereference it. Null is the root.
class KSModelDataFactory : public QObject
{
    Q_OBJECT
public:
    enum _controlType { LineEditControl = 0 };
    using controlType = _controlType;

    // The kind of data in a column, which selects the comparison for sorting.
    enum KSDataType { NoDataType = 0, NameDataType = 1, SizeDataType = 2, DateDataType = 3 };

    explicit KSModelDataFactory(QObject* parent = nullptr);

    // Creates the editor of a cell, which parent owns. Null if the cell has none. The default is a plain
    // QLineEdit.
    virtual QWidget* createControl(QWidget* parent, _controlType type, const QModelIndex& index);
    // Returns true if the editors report the end of an edit themselves, as those for the soft keyboard do.
    // The delegate then leaves Enter, Escape and the loss of focus to them.
    virtual bool isControlSelfEnding() const { return false; }

    // Reads the source again. Handles that were returned before must remain valid as arguments.
    virtual void importSourceData() = 0;
    // Returns the next node under the same parent; null after the last.
    virtual void* getNextNode(void* node) = 0;
    // Returns the first child of the node; null if there is none.
    virtual void* getChildNode(void* node) = 0;
    virtual void InstallItemAttribute(KSModelAttributeItem* item, void* node) = 0;

    // Returns NoDataType for a column that was not set.
    virtual KSDataType getColumnDataType(int column) const;
    virtual void setColumnDataType(int column, KSDataType type);

    // Returns whether the node has children. Called for every row on the screen, so it should be fast.
    virtual bool hasChildNode(void* node) { return getChildNode(node) != nullptr; }

private:
    QMap<int, KSDataType> m_columnDataTypes;
};

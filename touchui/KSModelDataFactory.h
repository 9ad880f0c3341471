#pragma once

#include <QMap>
#include <QObject>

class KSModelAttributeItem;
class KSModelItem;
class QModelIndex;
class QWidget;

// Gives a KSTreeModel its content by walking a source node by node. A node is an opaque handle of the
// factory's; the model keeps it and gives it back, and never follows it. Null stands for the root.
class KSModelDataFactory : public QObject
{
    Q_OBJECT
public:
    enum _controlType { LineEditControl = 0 };
    using controlType = _controlType;

    // The content of a column; the numbers choose the comparison when it is sorted.
    enum KSDataType { NoDataType = 0, NameDataType = 1, SizeDataType = 2, DateDataType = 3 };

    explicit KSModelDataFactory(QObject* parent = nullptr);

    // The editor of a cell; the caller owns it through parent. Null when the cell has none. Here a plain
    // QLineEdit.
    virtual QWidget* createControl(QWidget* parent, _controlType type, const QModelIndex& index);
    // True when the controls tell by themselves when an edit is over, as those do that a soft keyboard fills;
    // the delegate then leaves Enter, Escape and the loss of focus to them.
    virtual bool isControlSelfEnding() const { return false; }

    // Reads the source anew. Handles that were given out before may still be asked about.
    virtual void importSourceData() = 0;
    // The node behind this one under the same parent; null behind the last.
    virtual void* getNextNode(void* node) = 0;
    // The first node under this one; null when there is none.
    virtual void* getChildNode(void* node) = 0;
    virtual void InstallItemAttribute(KSModelAttributeItem* item, void* node) = 0;

    // NoDataType for a column that was not set.
    virtual KSDataType getColumnDataType(int column) const;
    virtual void setColumnDataType(int column, KSDataType type);

    // Whether there are nodes under this one. Asked for every row on the screen, so it should be cheap.
    virtual bool hasChildNode(void* node) { return getChildNode(node) != nullptr; }

private:
    QMap<int, KSDataType> m_columnDataTypes;
};

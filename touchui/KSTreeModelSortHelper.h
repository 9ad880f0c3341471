#pragma once

#include <QList>
#include <QObject>

class KSModelItem;

// The strategy by which a KSTreeModel sorts one child list.
class KSTreeModelSortHelper : public QObject
{
    Q_OBJECT
public:
    enum _sortKind { SortByName = 0, SortByDate = 1, SortBySize = 2 };

    explicit KSTreeModelSortHelper(QObject* parent = nullptr);

    // dataType is the KSModelDataFactory::KSDataType of the column, sortKind one of the above. The list is
    // not changed for unknown combinations.
    virtual void sortChildList(int dataType, int sortKind, QList<KSModelItem*>& list,
                               Qt::SortOrder order) = 0;
};

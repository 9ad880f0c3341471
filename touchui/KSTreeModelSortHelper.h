#pragma once

#include <QList>
#include <QObject>

class KSModelItem;

// How a KSTreeModel sorts one child list.
class KSTreeModelSortHelper : public QObject
{
    Q_OBJECT
public:
    enum _sortKind { SortByName = 0, SortByDate = 1, SortBySize = 2 };

    explicit KSTreeModelSortHelper(QObject* parent = nullptr);

    // dataType: the KSModelDataFactory::KSDataType of the column; sortKind: one of the above. A pair that
    // the helper does not know leaves the list as it is.
    virtual void sortChildList(int dataType, int sortKind, QList<KSModelItem*>& list,
                               Qt::SortOrder order) = 0;
};

#include "touchui/KSTreeModelDefaultSortHelper.h"

#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSModelDataFactory.h"
#include "touchui/KSModelItem.h"
#include "touchui/KSVIEW.h"

#include <QDateTime>
#include <algorithm>

namespace
{

using Comparison = bool (*)(KSModelItem*, KSModelItem*);

struct SortRow {
    int dataType;
    int sortKind;
    Comparison ascending;
    Comparison descending;
};

constexpr SortRow SORT_TABLE[] = {
    {KSModelDataFactory::NameDataType, KSTreeModelSortHelper::SortByName,
     &KSTreeModelDefaultSortHelper::FileNameAscending, &KSTreeModelDefaultSortHelper::FileNameDescending},
    {KSModelDataFactory::DateDataType, KSTreeModelSortHelper::SortByDate,
     &KSTreeModelDefaultSortHelper::FileDateTimeAscending,
     &KSTreeModelDefaultSortHelper::FileDateTimeDescending},
    {KSModelDataFactory::SizeDataType, KSTreeModelSortHelper::SortBySize,
     &KSTreeModelDefaultSortHelper::FileSizeAscending, &KSTreeModelDefaultSortHelper::FileSizeDescending},
};

QString nameOf(KSModelItem* item)
{
    return item->attributes()->getAttribute(Qt::DisplayRole, 0).toString();
}

QDateTime dateOf(KSModelItem* item)
{
    return item->attributes()->getAttribute(KSVIEW::ItemDateRole, 0).toDateTime();
}

qint64 sizeOf(KSModelItem* item)
{
    return item->attributes()->getAttribute(KSVIEW::ItemSizeRole, 0).toLongLong();
}

} // namespace

KSTreeModelDefaultSortHelper::KSTreeModelDefaultSortHelper(QObject* parent) : KSTreeModelSortHelper(parent)
{
}

void KSTreeModelDefaultSortHelper::sortChildList(int dataType, int sortKind, QList<KSModelItem*>& list,
                                                 Qt::SortOrder order)
{
    if (list.isEmpty())
        return;
    KSModelItem* parent = list.constFirst()->parent();
    if (parent == nullptr || !parent->attributes()->getAttribute(KSVIEW::ItemIsForderRole, 0).toBool())
        return;
    for (const SortRow& row : SORT_TABLE) {
        if (row.dataType == dataType && row.sortKind == sortKind) {
            std::stable_sort(list.begin(), list.end(),
                             order == Qt::AscendingOrder ? row.ascending : row.descending);
            return;
        }
    }
}

bool KSTreeModelDefaultSortHelper::FileNameAscending(KSModelItem* left, KSModelItem* right)
{
    return nameOf(left).localeAwareCompare(nameOf(right)) < 0;
}

bool KSTreeModelDefaultSortHelper::FileNameDescending(KSModelItem* left, KSModelItem* right)
{
    return FileNameAscending(right, left);
}

bool KSTreeModelDefaultSortHelper::FileDateTimeAscending(KSModelItem* left, KSModelItem* right)
{
    return dateOf(left) < dateOf(right);
}

bool KSTreeModelDefaultSortHelper::FileDateTimeDescending(KSModelItem* left, KSModelItem* right)
{
    return FileDateTimeAscending(right, left);
}

bool KSTreeModelDefaultSortHelper::FileSizeAscending(KSModelItem* left, KSModelItem* right)
{
    return sizeOf(left) < sizeOf(right);
}

bool KSTreeModelDefaultSortHelper::FileSizeDescending(KSModelItem* left, KSModelItem* right)
{
    return FileSizeAscending(right, left);
}

#pragma once

#include "touchui/KSTreeModelSortHelper.h"

// Sorts by name, date or size; the order of equal items is kept. Does not sort lists whose parent is not a
// folder.
class KSTreeModelDefaultSortHelper : public KSTreeModelSortHelper
{
    Q_OBJECT
public:
    explicit KSTreeModelDefaultSortHelper(QObject* parent = nullptr);

    void sortChildList(int dataType, int sortKind, QList<KSModelItem*>& list, Qt::SortOrder order) override;

    static bool FileNameAscending(KSModelItem* left, KSModelItem* right);
    static bool FileNameDescending(KSModelItem* left, KSModelItem* right);
    static bool FileDateTimeAscending(KSModelItem* left, KSModelItem* right);
    static bool FileDateTimeDescending(KSModelItem* left, KSModelItem* right);
    static bool FileSizeAscending(KSModelItem* left, KSModelItem* right);
    static bool FileSizeDescending(KSModelItem* left, KSModelItem* right);
};

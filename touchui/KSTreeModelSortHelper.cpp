#include "touchui/KSTreeModelSortHelper.h"

KSTreeModelSortHelper::KSTreeModelSortHelper(QObject* parent) : QObject(parent)
{
}

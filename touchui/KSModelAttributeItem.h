#pragma once

#include <QVariant>

// The attributes of a node: a value for each role and column. If the max key of a role is 0, which is the
// default, all columns share one value; if it is n, each of the columns 0 to n has its own value, and further
// columns have none.
class KSModelAttributeItem
{
public:
    virtual ~KSModelAttributeItem() = default;

    // Returns an invalid value if there is none and for a negative column.
    virtual QVariant getAttribute(int role, int column) const = 0;
    // Ignored if the column is negative or larger than the role's max key.
    virtual void setAttribute(int role, const QVariant& value, int column) = 0;
    // A shared value becomes that of column 0. If the key becomes smaller, values beyond it are discarded. A
    // negative key counts as 0.
    virtual void setAttributeMaxKey(int role, int maxColumn) = 0;
    virtual int getAttributeMaxKey(int role) const = 0;

    // Insert and remove columns in all roles that have values per column.
    virtual void insertAttributeColumns(int column, int count) = 0;
    virtual void removeAttributeColumns(int column, int count) = 0;
};

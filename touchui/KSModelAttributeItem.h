#pragma once

#include <QVariant>

// The bag of attributes of a node: a value per role and column. A role whose max key is 0, as every role at
// first, has one value that all columns share; with a max key of n the columns 0 to n have each their own,
// and those beyond have none.
class KSModelAttributeItem
{
public:
    virtual ~KSModelAttributeItem() = default;

    // Invalid when there is none, and for a negative column.
    virtual QVariant getAttribute(int role, int column) const = 0;
    // Ignored for a column below 0 or beyond the role's max key.
    virtual void setAttribute(int role, const QVariant& value, int column) = 0;
    // What was shared stays with column 0; values beyond a smaller key are dropped. Negative counts as 0.
    virtual void setAttributeMaxKey(int role, int maxColumn) = 0;
    virtual int getAttributeMaxKey(int role) const = 0;

    // Open and close a gap in the columns of all roles that have values per column.
    virtual void insertAttributeColumns(int column, int count) = 0;
    virtual void removeAttributeColumns(int column, int count) = 0;
};

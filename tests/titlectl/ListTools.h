// Looks into tables for the tests of lists.
#pragma once

#include "titlectl/ListTable.h"

#include <QString>
#include <QStringList>

// Returns the rows as "line: cell|cell", rows that cannot be used as "line! reason", or the error of the
// list.
inline QStringList rowsOf(const ListTable& table)
{
    if (table.hasFailed())
        return {table.error()};
    QStringList rows;
    for (int row = 0; row < table.rowCount(); ++row) {
        if (!table.fault(row).isEmpty()) {
            rows.append(QStringLiteral("%1! %2").arg(table.line(row)).arg(table.fault(row)));
            continue;
        }
        QStringList cells;
        for (int column = 0; column < table.columnCount(); ++column)
            cells.append(table.cell(row, column));
        rows.append(QString::number(table.line(row)) + QLatin1String(": ") + cells.join(QLatin1Char('|')));
    }
    return rows;
}

inline QString headerOf(const ListTable& table)
{
    QStringList names;
    for (int column = 0; column < table.columnCount(); ++column)
        names.append(table.columnName(column));
    return names.join(QLatin1Char('|'));
}

#pragma once

#include "titlectl/ListTable.h"

#include <QChar>
#include <QString>
#include <cstdlib>

// Ends the process if a table is not as its header says.
inline void checkList(const ListTable& table)
{
    if (table.hasFailed()) {
        if (table.rowCount() != 0)
            std::abort();
        return;
    }
    if (table.columnCount() == 0 || table.columnCount() > ListTable::COLUMN_LIMIT)
        std::abort();
    for (int row = 0; row < table.rowCount(); ++row) {
        bool hasText = !table.fault(row).isEmpty();
        for (int column = 0; column < table.columnCount(); ++column) {
            const QString cell = table.cell(row, column);
            hasText |= !cell.isEmpty();
            if (cell.contains(QChar(QChar::ReplacementCharacter)) || cell.contains(QLatin1Char('\r')) ||
                (!cell.isEmpty() && !table.fault(row).isEmpty()))
                std::abort();
        }
        if (!hasText)
            std::abort();
    }
}

#pragma once

#include "titlectl/ListTable.h"

#include <QChar>
#include <QString>
#include <QStringList>
#include <QStringView>

class QIODevice;

// Reads comma separated values as RFC 4180 describes them: cells may be in quotes, within which a quote is
// doubled and line breaks are text; lines end with CR LF, LF or CR. The separator is a comma, a semicolon or
// a tab, whichever the header has most. UTF-8, or UTF-16 with a byte order mark. Any thread.
//
// A row with a wrong quote or a wrong number of cells is kept as one that cannot be used, and reading goes on
// with the next line. The file is read piece by piece.
class CsvReader
{
public:
    // One row of a text.
    struct Row {
        enum class State {
            Good,
            Bad,    // the row is its first line only, and reason says why
            TooLong // a cell or the row is beyond the limits
        };
        State state = State::Good;
        QStringList cells;
        QString reason;
        // UTF-16 units with the line break at the end, and the line breaks in them.
        qsizetype length = 0;
        int lines = 0;
    };

    // device is open for reading.
    static ListTable read(QIODevice& device);

    // Returns the separator of a text that begins with a header.
    static QChar separatorOf(QStringView text);
    // Returns the row with which the text begins. The end of the text ends the row.
    static Row rowAt(QStringView text, QChar separator);
};

#pragma once

#include <QHash>
#include <QString>
#include <QStringList>
#include <string>
#include <vector>

// The rows of a list of texts as they were read: a header with the names of the columns, then rows of cells,
// each with its line in the file. A row that cannot be used is kept with the reason, so that it can be named;
// rows without any text are left out.
//
// Beyond one of the limits the whole list is refused: it has an error and no rows. Texts are kept as UTF-8,
// so that a list takes little more memory than its file. Any thread may read a complete table.
class ListTable
{
public:
    // Rows without the header, also those that cannot be used.
    static constexpr int ROW_LIMIT = 100000;
    static constexpr int COLUMN_LIMIT = 256;
    // Bytes as UTF-8.
    static constexpr qsizetype CELL_LIMIT = 64 * 1024;
    // Bytes of one row in a file, with its separators and quotes.
    static constexpr qsizetype ROW_BYTES_LIMIT = 1024 * 1024;
    // Bytes of the file, and also of all cells together.
    static constexpr qint64 FILE_LIMIT = 256LL * 1024 * 1024;

    // Refuses the whole list and drops its rows. Keeps the reason of the first call.
    void fail(const QString& reason);
    bool hasFailed() const { return !m_error.isEmpty(); }
    // Returns why the list was refused; empty if it was not.
    const QString& error() const { return m_error; }

    // Sets the names of the columns without the spaces around them. A column without a name is ignored.
    // Refuses the list if two names differ at most in case, or if there is none.
    void setHeader(const QStringList& names);
    // Adds a column to the header. Returns its index, or -1 if the list is refused for it.
    int addColumn(const QString& name);

    // Adds a row. Missing cells at its end are empty. The row is kept as one that cannot be used if it has
    // text beyond the header or characters that no title can show. Line breaks become "\n", tabs spaces.
    void addRow(int line, const QStringList& cells);
    // Adds a row that cannot be used. The reason is put behind "line 7: ".
    void addBadRow(int line, const QString& reason);

    int columnCount() const { return int(m_names.size()); }
    const QString& columnName(int column) const { return m_names[column]; }
    // Ignores case and the spaces around the name. Returns -1 if there is no such column.
    int columnOf(const QString& name) const;

    int rowCount() const { return int(m_rows.size()); }
    // One-based; the line where the row begins, or the number of the object or spreadsheet row.
    int line(int row) const { return m_rows[std::size_t(row)].line; }
    // Returns why the row cannot be used; empty if it can.
    const QString& fault(int row) const { return m_rows[std::size_t(row)].fault; }
    // Returns an empty string for a cell that the row does not have.
    QString cell(int row, int column) const;

private:
    struct Row {
        int line = 0;
        QString fault;
        std::string text;          // all cells, UTF-8
        std::vector<quint32> ends; // where each cell ends in the text
    };

    bool hasRoom();
    bool addCell(Row& row, const QString& cell);
    static QString unusable(const QString& text);

    QString m_error;
    QStringList m_names;
    QHash<QString, int> m_columns; // by the name in small letters
    std::vector<Row> m_rows;
    qint64 m_bytes = 0;
};

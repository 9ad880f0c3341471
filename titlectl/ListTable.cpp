#include "titlectl/ListTable.h"

#include <QByteArray>
#include <QChar>
#include <algorithm>
#include <utility>

namespace
{

QString withPlainLineBreaks(QString text)
{
    text.replace(QLatin1String("\r\n"), QLatin1String("\n"));
    for (QChar& c : text)
        if (c == QLatin1Char('\r') || c == QChar::ParagraphSeparator || c == QChar::LineSeparator)
            c = QLatin1Char('\n');
        else if (c == QLatin1Char('\t'))
            c = QLatin1Char(' ');
    return text;
}

bool isControl(QChar c)
{
    return c.category() == QChar::Other_Control && c != QLatin1Char('\n');
}

bool isNonCharacter(QChar c)
{
    return c.unicode() == 0xFFFE || c.unicode() == 0xFFFF;
}

QString folded(const QString& name)
{
    return name.trimmed().toCaseFolded();
}

} // namespace

void ListTable::fail(const QString& reason)
{
    if (m_error.isEmpty())
        m_error = reason;
    m_rows.clear();
    m_rows.shrink_to_fit();
}

// Returns why a title cannot show the text; empty if it can.
QString ListTable::unusable(const QString& text)
{
    // Bytes that are not characters have become U+FFFD.
    if (text.contains(QChar(QChar::ReplacementCharacter)))
        return QStringLiteral("its text is not UTF-8");
    if (std::any_of(text.begin(), text.end(), [](QChar c) { return isControl(c) || isNonCharacter(c); }))
        return QStringLiteral("it contains a control character");
    if (!text.isValidUtf16())
        return QStringLiteral("it contains half a character");
    return {};
}

void ListTable::setHeader(const QStringList& names)
{
    m_names.clear();
    m_columns.clear();
    for (const QString& name : names)
        if (addColumn(name) < 0)
            return;
    if (m_columns.isEmpty())
        fail(QStringLiteral("The header names no column"));
}

int ListTable::addColumn(const QString& name)
{
    const QString clean = withPlainLineBreaks(name).trimmed();
    if (columnCount() == COLUMN_LIMIT)
        fail(QStringLiteral("The list has more than %1 columns").arg(COLUMN_LIMIT));
    else if (const QString reason = unusable(clean); !reason.isEmpty())
        fail(QStringLiteral("The header cannot be used: %1").arg(reason));
    else if (clean.toUtf8().size() > CELL_LIMIT)
        fail(QStringLiteral("The name of a column is longer than %1 bytes").arg(CELL_LIMIT));
    else if (!clean.isEmpty() && m_columns.contains(folded(clean)))
        fail(QStringLiteral("Two columns are named \"%1\"").arg(clean));
    if (hasFailed())
        return -1;
    if (!clean.isEmpty())
        m_columns.insert(folded(clean), columnCount());
    m_names.append(clean);
    return columnCount() - 1;
}

int ListTable::columnOf(const QString& name) const
{
    return m_columns.value(folded(name), -1);
}

bool ListTable::hasRoom()
{
    if (rowCount() >= ROW_LIMIT)
        fail(QStringLiteral("The list has more than %1 rows").arg(ROW_LIMIT));
    return !hasFailed();
}

// Returns whether the cell was within the limits.
bool ListTable::addCell(Row& row, const QString& cell)
{
    const QByteArray bytes = cell.toUtf8();
    m_bytes += bytes.size();
    if (bytes.size() > CELL_LIMIT)
        fail(QStringLiteral("line %1: A cell is longer than %2 bytes").arg(row.line).arg(CELL_LIMIT));
    else if (m_bytes > FILE_LIMIT)
        fail(QStringLiteral("The texts of the list are longer than %1 bytes").arg(FILE_LIMIT));
    if (hasFailed())
        return false;
    row.text.append(bytes.constData(), std::size_t(bytes.size()));
    row.ends.push_back(quint32(row.text.size()));
    return true;
}

void ListTable::addRow(int line, const QStringList& cells)
{
    qsizetype count = cells.size();
    while (count > 0 && cells[count - 1].isEmpty())
        --count;
    if (count == 0 || !hasRoom())
        return;
    if (count > columnCount()) {
        addBadRow(line, QStringLiteral("it has text in column %1, the header has %2 columns")
                            .arg(count)
                            .arg(columnCount()));
        return;
    }
    Row row;
    row.line = line;
    row.ends.reserve(std::size_t(count));
    for (qsizetype column = 0; column < count; ++column) {
        const QString cell = withPlainLineBreaks(cells[column]);
        if (const QString reason = unusable(cell); !reason.isEmpty()) {
            addBadRow(line, QStringLiteral("column %1: %2").arg(column + 1).arg(reason));
            return;
        }
        if (!addCell(row, cell))
            return;
    }
    row.text.shrink_to_fit();
    m_rows.push_back(std::move(row));
}

void ListTable::addBadRow(int line, const QString& reason)
{
    if (!hasRoom())
        return;
    Row row;
    row.line = line;
    row.fault = reason;
    m_rows.push_back(std::move(row));
}

QString ListTable::cell(int row, int column) const
{
    const Row& found = m_rows[std::size_t(row)];
    const auto index = std::size_t(column);
    if (column < 0 || index >= found.ends.size())
        return {};
    const std::size_t begin = index == 0 ? 0 : found.ends[index - 1];
    return QString::fromUtf8(found.text.data() + begin, qsizetype(found.ends[index] - begin));
}

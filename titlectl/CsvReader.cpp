#include "titlectl/CsvReader.h"

#include <QByteArray>
#include <QIODevice>
#include <QStringConverter>
#include <algorithm>
#include <array>

namespace
{

constexpr QChar QUOTE = QLatin1Char('"');

bool isLineBreak(QChar c)
{
    return c == QLatin1Char('\n') || c == QLatin1Char('\r');
}

// Returns how many units the line break at the position has; 0 if there is none.
qsizetype lineBreakAt(QStringView text, qsizetype at)
{
    if (at >= text.size() || !isLineBreak(text[at]))
        return 0;
    return text[at] == QLatin1Char('\r') && at + 1 < text.size() && text[at + 1] == QLatin1Char('\n') ? 2 : 1;
}

// Splits the first row of a text into its cells.
class RowScan
{
public:
    RowScan(QStringView text, QChar separator) : m_text(text), m_separator(separator) {}

    CsvReader::Row run()
    {
        while (m_row.state == CsvReader::Row::State::Good) {
            if (m_at < m_text.size() && m_text[m_at] == QUOTE)
                quotedCell();
            else
                plainCell();
            if (m_row.state != CsvReader::Row::State::Good)
                break;
            if (m_at < m_text.size() && m_text[m_at] == m_separator) {
                ++m_at;
                continue;
            }
            finishLine();
            break;
        }
        if (m_row.state == CsvReader::Row::State::Bad)
            giveUp();
        return m_row;
    }

private:
    void bad(const QString& reason)
    {
        m_row.state = CsvReader::Row::State::Bad;
        m_row.reason = reason;
    }
    void tooLong() { m_row.state = CsvReader::Row::State::TooLong; }

    void finishLine()
    {
        const qsizetype units = lineBreakAt(m_text, m_at);
        m_row.lines += units > 0;
        m_at += units;
        m_row.length = m_at;
        if (m_row.length > ListTable::ROW_BYTES_LIMIT)
            tooLong();
    }

    // Reading goes on with the next line, since the row's own end is not known.
    void giveUp()
    {
        m_row.cells.clear();
        m_row.lines = 0;
        m_at = 0;
        while (m_at < m_text.size() && !isLineBreak(m_text[m_at]))
            ++m_at;
        finishLine();
    }

    void plainCell()
    {
        const qsizetype begin = m_at;
        while (m_at < m_text.size() && m_text[m_at] != m_separator && !isLineBreak(m_text[m_at])) {
            if (m_text[m_at] == QUOTE)
                return bad(QStringLiteral("a quote stands in a cell that does not begin with one"));
            ++m_at;
        }
        addCell(m_text.mid(begin, m_at - begin).toString());
    }

    void quotedCell()
    {
        QString cell;
        qsizetype begin = ++m_at;
        for (;; ++m_at) {
            if (m_at >= m_text.size() || m_at - begin + cell.size() > ListTable::CELL_LIMIT)
                return bad(QStringLiteral("a quote is not closed"));
            if (m_text[m_at] == QUOTE) {
                cell += m_text.mid(begin, m_at - begin);
                if (m_at + 1 >= m_text.size() || m_text[m_at + 1] != QUOTE)
                    break;
                begin = ++m_at; // the second quote is text
            } else if (m_text[m_at] == QLatin1Char('\n') || lineBreakAt(m_text, m_at) == 1) {
                ++m_row.lines;
            }
        }
        ++m_at;
        if (m_at < m_text.size() && m_text[m_at] != m_separator && !isLineBreak(m_text[m_at]))
            return bad(QStringLiteral("text follows a closing quote"));
        addCell(cell);
    }

    void addCell(const QString& cell)
    {
        if (cell.size() > ListTable::CELL_LIMIT || m_row.cells.size() >= ListTable::COLUMN_LIMIT)
            tooLong();
        m_row.cells.append(cell);
    }

    QStringView m_text;
    QChar m_separator;
    qsizetype m_at = 0;
    CsvReader::Row m_row;
};

// Decodes a file piece by piece. Holds at least the longest row that is allowed, unless the file ends before.
class TextWindow
{
public:
    explicit TextWindow(QIODevice& device)
        : m_device(device)
        , m_encoding(QStringConverter::encodingForData(device.peek(4)).value_or(QStringConverter::Utf8))
        , m_decoder(m_encoding)
    {
        refill();
        if (m_text.startsWith(QChar(QChar::ByteOrderMark)))
            m_begin = 1;
    }

    QStringView text() const { return QStringView(m_text).mid(m_begin); }
    bool isLast() const { return m_isLast; }

    void skip(qsizetype units)
    {
        m_begin += units;
        if (m_isLast || m_text.size() - m_begin > SIZE)
            return;
        m_text.remove(0, m_begin);
        m_begin = 0;
        refill();
    }

private:
    // One more than the longest row, so that a longer one is recognised.
    static constexpr qsizetype SIZE = ListTable::ROW_BYTES_LIMIT + 2;

    void refill()
    {
        while (!m_isLast && m_text.size() < 2 * SIZE) {
            QByteArray bytes = m_device.read(SIZE);
            m_isLast = bytes.isEmpty();
            // Makes half a character at the end visible, which the decoder would keep to itself.
            if (m_isLast && m_encoding == QStringConverter::Utf8)
                bytes = QByteArrayLiteral("\n");
            const QString text = m_decoder(bytes);
            m_text += text;
        }
    }

    QIODevice& m_device;
    QStringConverter::Encoding m_encoding;
    QStringDecoder m_decoder;
    QString m_text;
    qsizetype m_begin = 0;
    bool m_isLast = false;
};

bool isBlank(const QStringList& cells)
{
    return std::all_of(cells.begin(), cells.end(), [](const QString& cell) { return cell.isEmpty(); });
}

void addRow(ListTable& table, const CsvReader::Row& row, int line)
{
    if (row.state == CsvReader::Row::State::Bad)
        table.addBadRow(line, row.reason);
    else if (isBlank(row.cells))
        return;
    else if (row.cells.size() != table.columnCount())
        table.addBadRow(line, QStringLiteral("it has %1 columns, the header has %2")
                                  .arg(row.cells.size())
                                  .arg(table.columnCount()));
    else
        table.addRow(line, row.cells);
}

void setHeader(ListTable& table, const CsvReader::Row& row, int line)
{
    if (row.state == CsvReader::Row::State::Bad)
        table.fail(QStringLiteral("line %1: The header cannot be used: %2").arg(line).arg(row.reason));
    else if (!isBlank(row.cells))
        table.setHeader(row.cells);
}

} // namespace

QChar CsvReader::separatorOf(QStringView text)
{
    static constexpr std::array<QChar, 3> SEPARATORS = {QLatin1Char(','), QLatin1Char(';'),
                                                        QLatin1Char('\t')};
    std::array<int, 3> counts = {};
    bool isQuoted = false;
    for (const QChar c : text.left(ListTable::CELL_LIMIT)) {
        if (c == QUOTE)
            isQuoted = !isQuoted;
        if (isQuoted)
            continue;
        if (isLineBreak(c))
            break;
        for (std::size_t i = 0; i < SEPARATORS.size(); ++i)
            counts[i] += c == SEPARATORS[i];
    }
    const auto most = std::max_element(counts.begin(), counts.end());
    return SEPARATORS[std::size_t(most - counts.begin())];
}

CsvReader::Row CsvReader::rowAt(QStringView text, QChar separator)
{
    return RowScan(text, separator).run();
}

ListTable CsvReader::read(QIODevice& device)
{
    ListTable table;
    TextWindow window(device);
    QChar separator;
    for (int line = 1; !window.text().isEmpty() && !table.hasFailed();) {
        const bool isHeader = table.columnCount() == 0;
        if (isHeader)
            separator = separatorOf(window.text());
        const Row row = rowAt(window.text(), separator);
        if (row.state == Row::State::TooLong) {
            table.fail(
                QStringLiteral("line %1: A cell is longer than %2 bytes, the row longer than %3 bytes, or it "
                               "has more than %4 columns")
                    .arg(line)
                    .arg(ListTable::CELL_LIMIT)
                    .arg(ListTable::ROW_BYTES_LIMIT)
                    .arg(ListTable::COLUMN_LIMIT));
            break;
        }
        if (isHeader)
            setHeader(table, row, line);
        else
            addRow(table, row, line);
        line += row.lines;
        window.skip(row.length);
    }
    if (table.columnCount() == 0 && !table.hasFailed())
        table.fail(QStringLiteral("The list is empty"));
    return table;
}

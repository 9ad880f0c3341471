#include "titlectl/JsonListReader.h"

#include <QByteArray>
#include <QByteArrayView>
#include <QJsonDocument>
#include <QJsonObject>
#include <QJsonParseError>
#include <QJsonValue>
#include <QList>
#include <QLocale>
#include <QMetaType>
#include <QString>
#include <QStringList>
#include <QVariant>
#include <optional>

namespace
{

// Finds the elements of the outermost array without parsing them.
class ArrayScan
{
public:
    explicit ArrayScan(QByteArrayView bytes) : m_bytes(bytes)
    {
        if (m_bytes.startsWith("\xEF\xBB\xBF"))
            m_at = 3;
    }

    // Moves behind the "[". Returns false if the bytes do not begin with an array.
    bool enter() { return take('['); }

    // Moves to the next element. Returns false behind the last one, and after an error.
    bool next()
    {
        if (take(']')) {
            skipBlanks();
            if (m_at < m_bytes.size())
                m_error = QStringLiteral("line %1: Text follows the list").arg(m_line);
            return false;
        }
        if (m_afterElement && !take(',')) {
            m_error = QStringLiteral("line %1: A comma or the end of the list is missing").arg(m_line);
            return false;
        }
        skipBlanks();
        return readElement();
    }

    QByteArrayView element() const { return m_element; }
    int line() const { return m_elementLine; }
    const QString& error() const { return m_error; }

private:
    static bool isBlank(char c) { return c == ' ' || c == '\t' || c == '\n' || c == '\r'; }

    void skipBlanks()
    {
        for (; m_at < m_bytes.size() && isBlank(m_bytes[m_at]); ++m_at)
            m_line += m_bytes[m_at] == '\n';
    }

    bool take(char sign)
    {
        skipBlanks();
        if (m_at >= m_bytes.size() || m_bytes[m_at] != sign)
            return false;
        ++m_at;
        return true;
    }

    // A string ends at its line at the latest, so that a missing quote spoils one row only.
    void skipString()
    {
        for (++m_at; m_at < m_bytes.size() && m_bytes[m_at] != '"' && m_bytes[m_at] != '\n'; ++m_at)
            if (m_bytes[m_at] == '\\' && m_at + 1 < m_bytes.size() && m_bytes[m_at + 1] != '\n')
                ++m_at;
        if (m_at < m_bytes.size() && m_bytes[m_at] == '"')
            ++m_at;
    }

    bool readElement()
    {
        const qsizetype begin = m_at;
        m_elementLine = m_line;
        int depth = 0;
        while (m_at < m_bytes.size() && m_at - begin <= ListTable::ROW_BYTES_LIMIT) {
            const char c = m_bytes[m_at];
            if (depth == 0 && (c == ',' || c == ']')) {
                m_element = m_bytes.sliced(begin, m_at - begin).trimmed();
                m_afterElement = true;
                return true;
            }
            if (c == '"') {
                skipString();
                continue;
            }
            if (c == '{' || c == '[')
                ++depth;
            else if ((c == '}' || c == ']') && depth > 0)
                --depth;
            m_line += c == '\n';
            ++m_at;
        }
        m_error = m_at < m_bytes.size()
                      ? QStringLiteral("line %1: The row is longer than %2 bytes")
                            .arg(m_elementLine)
                            .arg(ListTable::ROW_BYTES_LIMIT)
                      : QStringLiteral("line %1: The row or the list has no end").arg(m_elementLine);
        return false;
    }

    QByteArrayView m_bytes;
    QByteArrayView m_element;
    QString m_error;
    qsizetype m_at = 0;
    int m_line = 1;
    int m_elementLine = 1;
    bool m_afterElement = false;
};

// Returns nothing for a list or an object.
std::optional<QString> textOf(const QJsonValue& value)
{
    switch (value.type()) {
    case QJsonValue::String:
        return value.toString();
    case QJsonValue::Double: {
        const QVariant number = value.toVariant(); // whole numbers keep all their digits
        return number.typeId() == QMetaType::LongLong ? QString::number(number.toLongLong())
                                                      : JsonListReader::numberText(value.toDouble());
    }
    case QJsonValue::Bool:
        return value.toBool() ? QStringLiteral("true") : QStringLiteral("false");
    case QJsonValue::Null:
    case QJsonValue::Undefined:
        return QString();
    default:
        return std::nullopt;
    }
}

// Returns why the object cannot be used; empty if its cells were filled.
QString fillCells(ListTable& table, const QJsonObject& object, QStringList& cells)
{
    QList<bool> filled;
    for (auto pair = object.begin(); pair != object.end(); ++pair) {
        const std::optional<QString> text = textOf(pair.value());
        if (!text)
            return QStringLiteral("\"%1\" is a list or an object").arg(pair.key());
        if (pair.key().trimmed().isEmpty())
            return QStringLiteral("a key is empty");
        int column = table.columnOf(pair.key());
        if (column < 0)
            column = table.addColumn(pair.key());
        if (column < 0)
            return table.error();
        if (column >= filled.size()) {
            filled.resize(column + 1);
            cells.resize(column + 1);
        }
        if (filled[column])
            return QStringLiteral("\"%1\" is there twice").arg(pair.key());
        filled[column] = true;
        cells[column] = *text;
    }
    return {};
}

void addElement(ListTable& table, QByteArrayView element, int line)
{
    if (!element.startsWith('{')) {
        table.addBadRow(line, QStringLiteral("it is not an object"));
        return;
    }
    QJsonParseError error;
    const QJsonDocument document =
        QJsonDocument::fromJson(QByteArray::fromRawData(element.data(), element.size()), &error);
    if (error.error != QJsonParseError::NoError) {
        table.addBadRow(line, QStringLiteral("it is not JSON: %1").arg(error.errorString()));
        return;
    }
    QStringList cells;
    const QString reason = fillCells(table, document.object(), cells);
    if (table.hasFailed())
        return;
    if (reason.isEmpty())
        table.addRow(line, cells);
    else
        table.addBadRow(line, reason);
}

} // namespace

QString JsonListReader::numberText(double number)
{
    return QString::number(number, 'f', QLocale::FloatingPointShortest);
}

ListTable JsonListReader::read(const QByteArray& bytes)
{
    ListTable table;
    ArrayScan scan(bytes);
    if (!scan.enter()) {
        table.fail(QStringLiteral("The list is not an array of objects"));
        return table;
    }
    while (!table.hasFailed() && scan.next())
        addElement(table, scan.element(), scan.line());
    if (!scan.error().isEmpty())
        table.fail(scan.error());
    else if (table.rowCount() == 0)
        table.fail(QStringLiteral("The list is empty"));
    else if (table.columnCount() == 0)
        table.fail(QStringLiteral("line %1: The row cannot be used, and no other can: %2")
                       .arg(table.line(0))
                       .arg(table.fault(0)));
    return table;
}

#include "titlectl/XlsxReader.h"

#include "titlectl/JsonListReader.h"
#include "titlectl/ZipXmlEntry.h"

#include <QDir>
#include <QHash>
#include <QString>
#include <QStringList>
#include <QXmlStreamReader>
#include <cmath>
#include <optional>
#include <string>
#include <vector>

namespace
{

constexpr int DEEPEST = 64;
// Links from one part of a workbook to others.
constexpr qsizetype MOST_LINKS = 1000;
constexpr int HIGHEST_ROW = 1048576;
constexpr int HIGHEST_COLUMN = 16384;

// Reads one part of a workbook token by token.
class Part
{
public:
    Part(const QString& path, const QString& name) : m_entry(path, name)
    {
        if (m_entry.isOpen())
            m_xml.setDevice(&m_entry);
        else
            m_error = m_entry.failure();
    }

    // Moves to the next token. Returns false at the end and after an error.
    bool next()
    {
        if (!m_error.isEmpty() || m_xml.atEnd())
            return false;
        switch (m_xml.readNext()) {
        case QXmlStreamReader::StartDocument:
            checkEncoding();
            break;
        case QXmlStreamReader::StartElement:
            if (++m_depth > DEEPEST)
                m_error = QStringLiteral("Its XML is too deep");
            break;
        case QXmlStreamReader::EndElement:
            --m_depth;
            break;
        case QXmlStreamReader::EndDocument:
            return false;
        case QXmlStreamReader::DTD:
        case QXmlStreamReader::EntityReference:
            m_error = QStringLiteral("Its XML has entities of its own");
            break;
        case QXmlStreamReader::Invalid:
            m_error = m_entry.failure().isEmpty() ? m_xml.errorString() : m_entry.failure();
            break;
        default:
            break;
        }
        return m_error.isEmpty();
    }

    bool begins(QLatin1String name) const { return m_xml.isStartElement() && m_xml.name() == name; }
    bool ends(QLatin1String name) const { return m_xml.isEndElement() && m_xml.name() == name; }
    bool isText() const { return m_xml.isCharacters(); }
    QStringView text() const { return m_xml.text(); }
    QString attribute(QLatin1String name) const { return m_xml.attributes().value(name).toString(); }
    // Returns the attribute that links to another part; its prefix differs between programs.
    QString linkId() const
    {
        const QXmlStreamAttributes attributes = m_xml.attributes();
        for (const QXmlStreamAttribute& each : attributes)
            if (each.name() == QLatin1String("id") && !each.namespaceUri().isEmpty())
                return each.value().toString();
        return {};
    }

    bool isMissing() const { return m_entry.isMissing(); }
    const QString& error() const { return m_error; }

private:
    void checkEncoding()
    {
        const QStringView encoding = m_xml.documentEncoding();
        if (!encoding.isEmpty() && encoding.compare(QLatin1String("UTF-8"), Qt::CaseInsensitive) != 0)
            m_error = QStringLiteral("Its XML is not UTF-8");
    }

    ZipXmlEntry m_entry;
    QXmlStreamReader m_xml;
    QString m_error;
    int m_depth = 0;
};

// Collects the text of a string, which may consist of runs. Leaves out how it is pronounced.
class RichText
{
public:
    void begin()
    {
        m_text.clear();
        m_inText = false;
        m_inPhonetic = false;
    }

    // Returns false when the text is too long.
    bool take(const Part& part)
    {
        if (part.begins(QLatin1String("rPh")))
            m_inPhonetic = true;
        else if (part.ends(QLatin1String("rPh")))
            m_inPhonetic = false;
        else if (part.begins(QLatin1String("t")))
            m_inText = true;
        else if (part.ends(QLatin1String("t")))
            m_inText = false;
        else if (part.isText() && m_inText && !m_inPhonetic)
            m_text += part.text();
        return m_text.size() <= ListTable::CELL_LIMIT;
    }

    // Returns the text with the signs that XML cannot contain, which workbooks write in this way.
    QString text() const
    {
        QString result = m_text;
        if (result.contains(QLatin1String("_x")))
            result.replace(QLatin1String("_x000D_"), QLatin1String("\r"))
                .replace(QLatin1String("_x005F_"), QLatin1String("_"));
        return result;
    }

private:
    QString m_text;
    bool m_inText = false;
    bool m_inPhonetic = false;
};

// The texts that cells refer to by number.
class SharedStrings
{
public:
    void add(const QString& text)
    {
        m_bytes += text.toStdString();
        m_ends.push_back(quint32(m_bytes.size()));
    }

    std::optional<QString> at(const QString& number) const
    {
        bool isNumber = false;
        const uint index = number.trimmed().toUInt(&isNumber);
        if (!isNumber || index >= m_ends.size())
            return std::nullopt;
        const std::size_t begin = index == 0 ? 0 : m_ends[index - 1];
        return QString::fromUtf8(m_bytes.data() + begin, qsizetype(m_ends[index] - begin));
    }

private:
    std::string m_bytes;
    std::vector<quint32> m_ends;
};

// Returns the zero-based column of a cell such as "B7"; -1 if the reference has none.
int columnOf(const QString& reference)
{
    int column = 0;
    for (const QChar c : reference) {
        if (c < QLatin1Char('A') || c > QLatin1Char('Z'))
            break;
        column = column * 26 + (c.unicode() - 'A' + 1);
        if (column > HIGHEST_COLUMN)
            return -1;
    }
    return column - 1;
}

// Reads a workbook into a table.
class Workbook
{
public:
    explicit Workbook(const QString& path) : m_path(path) {}

    ListTable read()
    {
        const QString book = relatedPart(QString(), QLatin1String("/officeDocument"));
        const Links links = readLinks(book);
        const QString sheet = firstSheet(book, links);
        for (const Link& link : links)
            if (link.type.endsWith(QLatin1String("/sharedStrings")))
                readSharedStrings(link.target);
        if (!m_table.hasFailed())
            readSheet(sheet);
        if (!m_table.hasFailed() && m_table.columnCount() == 0)
            m_table.fail(QStringLiteral("The list is empty"));
        return m_table;
    }

private:
    struct Link {
        QString type;
        QString target;
    };
    using Links = QHash<QString, Link>;

    // A row while it is read.
    struct Row {
        int number = 0;
        QStringList cells;
        QString fault;
    };
    struct Cell {
        int column = -1;
        QString type;
        QString value;
        RichText inlineText;
    };

    void finish(const Part& part)
    {
        if (!part.error().isEmpty())
            m_table.fail(QStringLiteral("The workbook cannot be read: %1").arg(part.error()));
    }

    // Returns the links of a part, those of the workbook file itself for an empty name.
    Links readLinks(const QString& partName)
    {
        Links links;
        const QString folder = partName.left(partName.lastIndexOf(QLatin1Char('/')) + 1);
        Part part(m_path,
                  folder + QLatin1String("_rels/") + partName.mid(folder.size()) + QLatin1String(".rels"));
        while (part.next() && links.size() < MOST_LINKS) {
            if (!part.begins(QLatin1String("Relationship")))
                continue;
            const QString target = part.attribute(QLatin1String("Target"));
            const QString whole = target.startsWith(QLatin1Char('/')) ? target.mid(1) : folder + target;
            links.insert(part.attribute(QLatin1String("Id")),
                         {part.attribute(QLatin1String("Type")), QDir::cleanPath(whole)});
        }
        finish(part);
        return links;
    }

    QString relatedPart(const QString& partName, QLatin1String type)
    {
        for (const Link& link : readLinks(partName))
            if (link.type.endsWith(type))
                return link.target;
        m_table.fail(QStringLiteral("The file is not a workbook"));
        return {};
    }

    QString firstSheet(const QString& book, const Links& links)
    {
        if (m_table.hasFailed())
            return {};
        Part part(m_path, book);
        while (part.next()) {
            if (!part.begins(QLatin1String("sheet")))
                continue;
            const Link link = links.value(part.linkId());
            if (link.type.endsWith(QLatin1String("/worksheet")))
                return link.target;
        }
        finish(part);
        m_table.fail(QStringLiteral("The workbook has no worksheet"));
        return {};
    }

    void readSharedStrings(const QString& name)
    {
        if (m_table.hasFailed())
            return;
        Part part(m_path, name);
        RichText text;
        while (part.next())
            if (part.begins(QLatin1String("si")))
                text.begin();
            else if (part.ends(QLatin1String("si")))
                m_strings.add(text.text());
            else if (!text.take(part))
                return failForCell();
        finish(part);
    }

    void failForCell()
    {
        m_table.fail(QStringLiteral("A cell is longer than %1 bytes").arg(ListTable::CELL_LIMIT));
    }

    void readSheet(const QString& name)
    {
        Part part(m_path, name);
        Row row;
        Cell cell;
        bool inValue = false;
        while (!m_table.hasFailed() && part.next()) {
            if (part.begins(QLatin1String("row"))) {
                beginRow(part, row);
                cell.column = -1;
            } else if (part.ends(QLatin1String("row"))) {
                addRow(row);
            } else if (part.begins(QLatin1String("c"))) {
                beginCell(part, cell);
            } else if (part.ends(QLatin1String("c"))) {
                addCell(cell, row);
            } else if (part.begins(QLatin1String("v")) || part.ends(QLatin1String("v"))) {
                inValue = part.begins(QLatin1String("v"));
            } else if (part.ends(QLatin1String("sheetData"))) {
                return;
            } else if (inValue && part.isText()) {
                cell.value += part.text();
            } else if (!inValue && !cell.inlineText.take(part)) {
                failForCell();
            }
            if (cell.value.size() > ListTable::CELL_LIMIT)
                failForCell();
        }
        finish(part);
    }

    static void beginRow(const Part& part, Row& row)
    {
        bool isNumber = false;
        const int number = part.attribute(QLatin1String("r")).toInt(&isNumber);
        row.number = isNumber && number > 0 && number <= HIGHEST_ROW ? number : row.number + 1;
        row.cells.clear();
        row.fault.clear();
    }

    static void beginCell(const Part& part, Cell& cell)
    {
        const QString reference = part.attribute(QLatin1String("r"));
        cell.column = reference.isEmpty() ? cell.column + 1 : columnOf(reference);
        cell.type = part.attribute(QLatin1String("t"));
        cell.value.clear();
        cell.inlineText.begin();
    }

    // Returns the text of the cell; sets the fault if it has none that can be used.
    QString textOf(const Cell& cell, QString& fault) const
    {
        if (cell.type == QLatin1String("inlineStr"))
            return cell.inlineText.text();
        if (cell.value.isEmpty() || cell.type == QLatin1String("str") || cell.type == QLatin1String("d"))
            return cell.value;
        if (cell.type == QLatin1String("s")) {
            const std::optional<QString> shared = m_strings.at(cell.value);
            if (!shared)
                fault = QStringLiteral("column %1 refers to a text that is missing").arg(cell.column + 1);
            return shared.value_or(QString());
        }
        if (cell.type == QLatin1String("b"))
            return cell.value.trimmed() == QLatin1String("1") ? QStringLiteral("TRUE")
                                                              : QStringLiteral("FALSE");
        if (cell.type == QLatin1String("e")) {
            fault = QStringLiteral("column %1 has the error %2").arg(cell.column + 1).arg(cell.value);
            return {};
        }
        bool isNumber = false;
        const double number = cell.value.toDouble(&isNumber);
        return isNumber && std::isfinite(number) ? JsonListReader::numberText(number) : cell.value;
    }

    void addCell(Cell& cell, Row& row)
    {
        QString fault;
        const QString text = textOf(cell, fault);
        if (!fault.isEmpty() && row.fault.isEmpty())
            row.fault = fault;
        if (text.isEmpty())
            return;
        if (cell.column < 0) {
            row.fault = QStringLiteral("a cell has no column");
        } else if (cell.column >= ListTable::COLUMN_LIMIT) {
            m_table.fail(QStringLiteral("The list has more than %1 columns").arg(ListTable::COLUMN_LIMIT));
        } else {
            if (row.cells.size() <= cell.column)
                row.cells.resize(cell.column + 1);
            row.cells[cell.column] = text;
        }
        cell.value.clear();
    }

    void addRow(const Row& row)
    {
        const bool isHeader = m_table.columnCount() == 0;
        if (row.cells.isEmpty() && row.fault.isEmpty())
            return;
        if (isHeader && !row.fault.isEmpty())
            m_table.fail(
                QStringLiteral("row %1: The header cannot be used: %2").arg(row.number).arg(row.fault));
        else if (isHeader)
            m_table.setHeader(row.cells);
        else if (!row.fault.isEmpty())
            m_table.addBadRow(row.number, row.fault);
        else
            m_table.addRow(row.number, row.cells);
    }

    QString m_path;
    ListTable m_table;
    SharedStrings m_strings;
};

} // namespace

ListTable XlsxReader::read(const QString& path)
{
    return Workbook(path).read();
}

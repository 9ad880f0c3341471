#include "bench/MarkedTable.h"

#include <QRegularExpression>

namespace
{

// The part of the document between two marks.
struct Part {
    qsizetype begin;
    qsizetype end;
};

std::optional<Part> find(const QString& document, const QString& name)
{
    const QString begin = QStringLiteral("<!-- %1 -->\n").arg(name);
    const qsizetype first = document.indexOf(begin);
    if (first == -1)
        return std::nullopt;
    const qsizetype last = document.indexOf(QStringLiteral("<!-- end of %1 -->").arg(name), first);
    if (last == -1)
        return std::nullopt;
    return Part{first + begin.size(), last};
}

} // namespace

QString MarkedTable::row(const QStringList& cells)
{
    QString row = QStringLiteral("|");
    for (QString cell : cells) {
        cell.replace(QLatin1Char('|'), QStringLiteral("\\|"));
        row += cell.isEmpty() ? QStringLiteral(" |") : QStringLiteral(" %1 |").arg(cell);
    }
    return row;
}

std::optional<QString> MarkedTable::replaced(const QString& document, const QString& name,
                                             const QStringList& lines)
{
    const std::optional<Part> part = find(document, name);
    if (!part)
        return std::nullopt;
    QString text;
    for (const QString& line : lines)
        text += line + QLatin1Char('\n');
    return document.left(part->begin) + text + document.mid(part->end);
}

QStringList MarkedTable::namesIn(const QString& document, const QString& name)
{
    const std::optional<Part> part = find(document, name);
    if (!part)
        return {};
    static const QRegularExpression firstCell(QStringLiteral("^\\| *`([^`]+)`"),
                                              QRegularExpression::MultilineOption);
    QStringList names;
    auto rows = firstCell.globalMatch(document.mid(part->begin, part->end - part->begin));
    while (rows.hasNext())
        names.append(rows.next().captured(1));
    return names;
}

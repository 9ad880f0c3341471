#pragma once

#include <QString>
#include <QStringList>
#include <optional>

// Tables of a document that a program writes. Each stands between the lines "<!-- NAME -->" and
// "<!-- end of NAME -->".
namespace MarkedTable
{

// Returns a row of a table; "|" in a cell is escaped.
QString row(const QStringList& cells);

// Returns the document with these lines in place of those between the marks; nothing when the document does
// not have both marks, in this order.
std::optional<QString> replaced(const QString& document, const QString& name, const QStringList& lines);

// Returns what stands in backticks at the beginning of the rows between the marks, in their order.
QStringList namesIn(const QString& document, const QString& name);

} // namespace MarkedTable

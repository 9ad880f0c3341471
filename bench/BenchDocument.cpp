#include "bench/BenchDocument.h"

#include "bench/BareFiles.h"
#include "bench/MarkedTable.h"
#include "bench/PairList.h"
#include "bench/PairReporter.h"
#include "bench/PeerComparison.h"

#include <QDate>
#include <QFile>
#include <QStringList>
#include <cstdio>
#include <optional>

namespace
{

const QString PAIRS = QStringLiteral("pairs");
const QString RESULTS = QStringLiteral("results");
const QString GROWTH = QStringLiteral("growth");
const QString PEERS = QStringLiteral("peers");

std::optional<QString> read(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        std::fprintf(stderr, "%s: %s\n", qPrintable(path), qPrintable(file.errorString()));
        return std::nullopt;
    }
    return QString::fromUtf8(file.readAll());
}

// Returns the lines that say on what machine and when a table was measured.
QStringList stateOf(const std::string& machine, std::size_t repetitions)
{
    return {QString(), QStringLiteral("Measured on %1, %2 processors, %3 repetitions. %4")
                           .arg(QDate::currentDate().toString(Qt::ISODate))
                           .arg(BareFiles::processors())
                           .arg(repetitions)
                           .arg(QString::fromStdString(machine))};
}

bool isEqual(const QString& table, const QStringList& document, const QStringList& program)
{
    for (const QString& name : program)
        if (!document.contains(name))
            std::fprintf(stderr, "the table \"%s\" lacks %s\n", qPrintable(table), qPrintable(name));
    for (const QString& name : document)
        if (!program.contains(name))
            std::fprintf(stderr, "the table \"%s\" names %s, which is not measured\n", qPrintable(table),
                         qPrintable(name));
    return document == program;
}

} // namespace

BenchDocument::BenchDocument(const QString& path) : m_path(path)
{
}

bool BenchDocument::writeResults(const PairReporter& reporter, const std::string& machine) const
{
    const QStringList results = reporter.pairTable();
    const QStringList growth = reporter.growthTable();
    if (results.isEmpty() || growth.isEmpty()) {
        std::fprintf(stderr, "not everything was measured, so %s stays as it is\n", qPrintable(m_path));
        return false;
    }
    return write({{RESULTS, results + stateOf(machine, reporter.repetitions())}, {GROWTH, growth}});
}

bool BenchDocument::writePeers(const QStringList& table, const std::string& machine) const
{
    return write({{PEERS, table + stateOf(machine, PeerComparison::REPETITIONS)}});
}

bool BenchDocument::write(const QList<Table>& tables) const
{
    std::optional<QString> document = read(m_path);
    for (const Table& table : tables)
        if (document)
            document = MarkedTable::replaced(*document, table.name, table.lines);
    if (!document || !BareFiles::write(m_path, document->toUtf8())) {
        std::fprintf(stderr, "%s: the tables cannot be written\n", qPrintable(m_path));
        return false;
    }
    return true;
}

bool BenchDocument::names(const PairList& list) const
{
    const std::optional<QString> document = read(m_path);
    if (!document)
        return false;
    QStringList pairs;
    for (const PairList::Pair& pair : list.pairs())
        pairs.append(QString::fromStdString(pair.name));
    QStringList growths;
    for (const PairList::Growth& growth : list.growths())
        growths.append(QString::fromStdString(growth.name));
    bool isRight = isEqual(RESULTS, MarkedTable::namesIn(*document, RESULTS), pairs);
    isRight = isEqual(GROWTH, MarkedTable::namesIn(*document, GROWTH), growths) && isRight;
    return isEqual(PAIRS, MarkedTable::namesIn(*document, PAIRS), pairs) && isRight;
}

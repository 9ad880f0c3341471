#pragma once

#include <QList>
#include <QString>
#include <QStringList>
#include <string>

class PairList;
class PairReporter;

// The document that describes the benchmarks. Its tables "results", "growth" and "peers" are written by this
// program; "pairs" says by hand what is measured. What is wrong goes to standard error.
class BenchDocument
{
public:
    explicit BenchDocument(const QString& path);

    // Replaces the results of pairs and growths. Returns false, with the document unchanged, when one of them
    // was not measured or the document cannot be read or written. machine: a sentence on the state of the
    // machine.
    bool writeResults(const PairReporter& reporter, const std::string& machine) const;
    // As above, for the comparison with other programs.
    bool writePeers(const QStringList& table, const std::string& machine) const;

    // Returns whether every table names exactly the pairs and growths of the list, in its order.
    bool names(const PairList& list) const;

private:
    // The lines that take the place of a table.
    struct Table {
        QString name;
        QStringList lines;
    };

    bool write(const QList<Table>& tables) const;

    QString m_path;
};

#pragma once

#include "bench/PairList.h"

#include <QStringList>

#include <cstddef>
#include <map>
#include <string>
#include <vector>

// Prints the usual table of the benchmarks, followed by one line for every pair with its times, their spread,
// its ratio and its aim, and one for every growth with its times and their exponent.
class PairReporter : public benchmark::ConsoleReporter
{
public:
    explicit PairReporter(const PairList& pairs);

    void ReportRuns(const std::vector<Run>& runs) override;
    void Finalize() override;

    // Return whether a benchmark has reported an error, and how many pairs and growths have missed their aim.
    bool failed() const { return m_failed; }
    int missed() const { return m_missed; }

    // Returns how often each benchmark was repeated.
    std::size_t repetitions() const;

    // Return the tables of the pairs and of the growths as lines of a document; nothing when one of them was
    // not measured.
    QStringList pairTable() const;
    QStringList growthTable() const;

private:
    // Seconds of one iteration in each repetition.
    struct Times {
        std::vector<double> cpu;
        std::vector<double> wall;
    };
    // A row of a printed table; the last cell says whether the aim is missed.
    using Row = std::vector<std::string>;

    // Returns the seconds that count for this clock; nothing when the benchmark did not run.
    std::vector<double> timesOf(const std::string& name, PairList::Clock clock) const;
    // Return an empty row for what was not measured.
    Row pairRow(const PairList::Pair& pair) const;
    Row growthRow(const PairList::Growth& growth) const;
    void print(const Row& row);

    const PairList& m_pairs;
    std::map<std::string, Times> m_times;
    bool m_failed = false;
    int m_missed = 0;
};

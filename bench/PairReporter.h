#pragma once

#include "bench/PairList.h"

#include <map>

// Prints the usual table of the benchmarks, followed by one line for every pair with its ratio and its aim.
class PairReporter : public benchmark::ConsoleReporter
{
public:
    explicit PairReporter(const PairList& pairs);

    void ReportRuns(const std::vector<Run>& runs) override;
    void Finalize() override;

    // Return whether a benchmark has reported an error, and how many pairs have missed their aim.
    bool failed() const { return m_failed; }
    int missed() const { return m_missed; }

private:
    struct Times {
        std::vector<double> cpu;
        std::vector<double> wall;
    };

    // Returns the seconds of one iteration, the median of all repetitions; 0 when the benchmark did not run.
    double timeOf(const std::string& name, PairList::Clock clock) const;
    void printPair(const PairList::Pair& pair);

    const PairList& m_pairs;
    std::map<std::string, Times> m_times;
    bool m_failed = false;
    int m_missed = 0;
};

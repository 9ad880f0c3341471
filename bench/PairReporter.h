// The usual table of the benchmarks, and after it one line for every pair with its ratio and its aim.
#pragma once

#include "bench/PairList.h"

#include <map>

class PairReporter : public benchmark::ConsoleReporter
{
public:
    explicit PairReporter(const PairList& pairs);

    void ReportRuns(const std::vector<Run>& runs) override;
    void Finalize() override;

    // Whether some benchmark reported an error, and how many pairs missed their aim.
    bool failed() const { return mFailed; }
    int missed() const { return mMissed; }

private:
    struct Times {
        std::vector<double> cpu;
        std::vector<double> wall;
    };

    // Seconds of one iteration, the middle one of all repetitions; 0 when the benchmark did not run.
    double timeOf(const std::string& name, PairList::Clock clock) const;
    void printPair(const PairList::Pair& pair);

    const PairList& mPairs;
    std::map<std::string, Times> mTimes;
    bool mFailed = false;
    int mMissed = 0;
};

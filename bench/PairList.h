// The benchmarks come in pairs: the program's own work, and the least that the same work can cost with the
// libraries at hand. Only the ratio of the two says something about the program; times say something about
// the machine.
#pragma once

#include <benchmark/benchmark.h>

#include <functional>
#include <string>
#include <vector>

class PairList
{
public:
    // Which clock the ratio is taken from: of the measured thread, for work that waits for nothing, or of the
    // wall, for work with files, threads or other processes. Step is the wall's, too, for the part of an
    // iteration that the body itself has measured.
    enum class Clock { Cpu, Wall, Step };

    struct Pair {
        std::string name;
        double aim; // the ratio that is to be reached
        Clock clock;
        double limit = 0; // milliseconds that ours may take at most; 0 for any time
    };

    using Body = std::function<void(benchmark::State&)>;

    // Registers "<name>/ours" and "<name>/floor". Bodies run in the main thread.
    void add(const Pair& pair, benchmark::TimeUnit unit, const Body& ours, const Body& floor);

    const std::vector<Pair>& pairs() const { return mPairs; }

private:
    std::vector<Pair> mPairs;
};

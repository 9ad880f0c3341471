#pragma once

#include <benchmark/benchmark.h>

#include <functional>
#include <string>
#include <vector>

// The benchmarks are pairs: the program's own work, and the least that the same work can cost with the
// libraries available. Only the ratio of the two describes the program; the times depend on the machine.
class PairList
{
public:
    // The clock from which the ratio is computed. Cpu: of the measured thread, for work that does not wait.
    // Process: of all threads of this process. Wall: for work with files, threads or other processes. Step:
    // wall clock for the part of an iteration that the body measures itself.
    enum class Clock { Cpu, Process, Wall, Step };

    struct Pair {
        std::string name;
        double aim; // the ratio to be reached
        Clock clock;
        double limit = 0; // milliseconds that "ours" may take at most; 0 for no limit
    };

    using Body = std::function<void(benchmark::State&)>;

    // Registers "<name>/ours" and "<name>/floor". The bodies run in the main thread.
    void add(const Pair& pair, benchmark::TimeUnit unit, const Body& ours, const Body& floor);

    const std::vector<Pair>& pairs() const { return m_pairs; }

private:
    std::vector<Pair> m_pairs;
};

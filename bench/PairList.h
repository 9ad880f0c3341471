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
    // wall clock for the part of an iteration that the body measures itself. Children: processor time of
    // other processes, which the body measures itself.
    enum class Clock { Cpu, Process, Wall, Step, Children };

    struct Pair {
        std::string name;
        double aim; // the ratio to be reached; 0 if only the limit counts
        Clock clock;
        double limit = 0; // milliseconds that "ours" may take at most; 0 for no limit
    };

    // Work that is measured for several sizes, to see how its time grows.
    struct Growth {
        std::string name;
        double aim; // the exponent to be reached: 1 for a time in proportion to the size
        Clock clock;
        std::vector<long> sizes;
        std::string unit; // of the sizes, in the plural
    };

    using Body = std::function<void(benchmark::State&)>;
    using SizedBody = std::function<void(benchmark::State&, long)>;

    // Registers "<name>/ours" and "<name>/floor". The bodies run in the main thread.
    void add(const Pair& pair, benchmark::TimeUnit unit, const Body& ours, const Body& floor);

    // Registers "<name>/<size>" for each size.
    void addGrowth(const Growth& growth, benchmark::TimeUnit unit, const SizedBody& body);

    const std::vector<Pair>& pairs() const { return m_pairs; }
    const std::vector<Growth>& growths() const { return m_growths; }

    // Returns the name of one benchmark of a growth.
    static std::string nameOf(const Growth& growth, long size);

private:
    std::vector<Pair> m_pairs;
    std::vector<Growth> m_growths;
};

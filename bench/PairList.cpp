#include "bench/PairList.h"

void PairList::add(const Pair& pair, benchmark::TimeUnit unit, const Body& ours, const Body& floor)
{
    const auto enter = [&](const char* side, const Body& body) {
        auto* entry = benchmark::RegisterBenchmark((pair.name + side).c_str(), body)->Unit(unit);
        if (pair.clock == Clock::Process)
            entry->MeasureProcessCPUTime();
        else if (pair.clock == Clock::Wall)
            entry->UseRealTime();
        else if (pair.clock == Clock::Step)
            entry->UseManualTime();
    };
    enter("/ours", ours);
    enter("/floor", floor);
    m_pairs.push_back(pair);
}

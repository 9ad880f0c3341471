#include "bench/PairList.h"

namespace
{

void enter(const std::string& name, PairList::Clock clock, benchmark::TimeUnit unit,
           const PairList::Body& body)
{
    auto* entry = benchmark::RegisterBenchmark(name.c_str(), body)->Unit(unit);
    if (clock == PairList::Clock::Process)
        entry->MeasureProcessCPUTime();
    else if (clock == PairList::Clock::Wall)
        entry->UseRealTime();
    else if (clock == PairList::Clock::Step || clock == PairList::Clock::Children)
        entry->UseManualTime();
}

} // namespace

void PairList::add(const Pair& pair, benchmark::TimeUnit unit, const Body& ours, const Body& floor)
{
    enter(pair.name + "/ours", pair.clock, unit, ours);
    enter(pair.name + "/floor", pair.clock, unit, floor);
    m_pairs.push_back(pair);
}

void PairList::addGrowth(const Growth& growth, benchmark::TimeUnit unit, const SizedBody& body)
{
    for (const long size : growth.sizes)
        enter(nameOf(growth, size), growth.clock, unit,
              [body, size](benchmark::State& state) { body(state, size); });
    m_growths.push_back(growth);
}

std::string PairList::nameOf(const Growth& growth, long size)
{
    return growth.name + '/' + std::to_string(size);
}

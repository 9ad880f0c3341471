#include "bench/PairReporter.h"

#include <algorithm>
#include <iomanip>
#include <iterator>

namespace
{

constexpr int NAME_WIDTH = 32;
constexpr int NUMBER_WIDTH = 12;

double median(std::vector<double> values)
{
    if (values.empty())
        return 0;
    std::sort(values.begin(), values.end());
    const std::size_t middle = values.size() / 2;
    return values.size() % 2 == 1 ? values[middle] : (values[middle - 1] + values[middle]) / 2;
}

} // namespace

PairReporter::PairReporter(const PairList& pairs) : ConsoleReporter(OO_Tabular), m_pairs(pairs)
{
}

void PairReporter::ReportRuns(const std::vector<Run>& runs)
{
    for (const Run& run : runs) {
        if (run.error_occurred) {
            m_failed = true;
        } else if (run.run_type == Run::RT_Iteration && run.iterations > 0) {
            Times& times = m_times[run.run_name.function_name];
            const auto iterations = static_cast<double>(run.iterations);
            times.cpu.push_back(run.cpu_accumulated_time / iterations);
            times.wall.push_back(run.real_accumulated_time / iterations);
        }
    }
    // Of several repetitions only the median is printed.
    std::vector<Run> shown;
    std::copy_if(runs.begin(), runs.end(), std::back_inserter(shown), [](const Run& run) {
        return run.error_occurred || run.repetitions <= 1 || run.aggregate_name == "median";
    });
    if (!shown.empty())
        ConsoleReporter::ReportRuns(shown);
}

double PairReporter::timeOf(const std::string& name, PairList::Clock clock) const
{
    const auto found = m_times.find(name);
    if (found == m_times.end())
        return 0;
    const bool isProcessorTime = clock == PairList::Clock::Cpu || clock == PairList::Clock::Process;
    return median(isProcessorTime ? found->second.cpu : found->second.wall);
}

void PairReporter::Finalize()
{
    std::ostream& out = GetOutputStream();
    out << "\n"
        << std::left << std::setw(NAME_WIDTH) << "Pair" << std::right << std::setw(NUMBER_WIDTH)
        << "ours [ms]" << std::setw(NUMBER_WIDTH) << "floor [ms]" << std::setw(NUMBER_WIDTH) << "ratio"
        << std::setw(NUMBER_WIDTH) << "aim"
        << "\n";
    for (const PairList::Pair& pair : m_pairs.pairs())
        printPair(pair);
    out << std::flush;
}

void PairReporter::printPair(const PairList::Pair& pair)
{
    const double ours = timeOf(pair.name + "/ours", pair.clock);
    const double floor = timeOf(pair.name + "/floor", pair.clock);
    if (ours <= 0 || floor <= 0)
        return;
    const double ratio = ours / floor;
    constexpr double MILLISECONDS = 1000;
    const bool inTime = pair.limit <= 0 || ours * MILLISECONDS <= pair.limit;
    const bool reached = ratio <= pair.aim && inTime;
    if (!reached)
        ++m_missed;
    GetOutputStream() << std::left << std::setw(NAME_WIDTH) << pair.name << std::right << std::fixed
                      << std::setw(NUMBER_WIDTH) << std::setprecision(4) << ours * MILLISECONDS
                      << std::setw(NUMBER_WIDTH) << floor * MILLISECONDS << std::setprecision(2)
                      << std::setw(NUMBER_WIDTH) << ratio << std::setw(NUMBER_WIDTH) << pair.aim
                      << (reached ? "" : "  missed") << "\n";
}

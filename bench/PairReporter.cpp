#include "bench/PairReporter.h"

#include "bench/MarkedTable.h"
#include "bench/Statistics.h"

#include <QString>
#include <algorithm>
#include <array>
#include <cstdio>
#include <iomanip>
#include <iterator>
#include <utility>

namespace
{

constexpr int NAME_WIDTH = 32;
constexpr int CELL_WIDTH = 13;
constexpr double MILLISECONDS = 1000;
constexpr double PERCENT = 100;
constexpr const char* MISSED = "missed";

std::string formatted(const char* format, double value)
{
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), format, value);
    return text.data();
}

// Three digits of a time, whatever its size.
std::string milliseconds(double seconds)
{
    const double value = seconds * MILLISECONDS;
    if (value >= 10)
        return formatted("%.1f", value);
    return formatted(value >= 0.1 ? "%.2f" : "%.4f", value);
}

std::string percent(double share)
{
    return formatted("%.0f %%", share * PERCENT);
}

const char* clockName(PairList::Clock clock)
{
    switch (clock) {
    case PairList::Clock::Cpu:
        return "processor";
    case PairList::Clock::Process:
        return "all threads";
    case PairList::Clock::Wall:
        return "wall";
    case PairList::Clock::Children:
        return "all threads";
    case PairList::Clock::Step:
        break;
    }
    return "wall, a step";
}

std::string aimOf(const PairList::Pair& pair)
{
    std::string aim = pair.aim > 0 ? formatted("%.3g", pair.aim) : std::string();
    if (pair.limit > 0)
        aim += (aim.empty() ? "" : ", ") + formatted("%g ms", pair.limit);
    return aim;
}

const std::vector<std::string> PAIR_HEAD = {"Pair",   "time",  "ours [ms]", "spread", "floor [ms]",
                                            "spread", "ratio", "aim",       ""};
const std::vector<std::string> GROWTH_HEAD = {"Growth", "time", "of", "[ms]", "exponent", "aim", ""};

QString markdownRow(const std::vector<std::string>& row, bool isHead)
{
    QStringList cells;
    for (const std::string& cell : row)
        cells.append(QString::fromStdString(cell));
    if (!isHead)
        cells.front() = QLatin1Char('`') + cells.front() + QLatin1Char('`');
    return MarkedTable::row(cells);
}

// Returns nothing when a row is empty.
QStringList markdown(const std::vector<std::string>& head, const std::vector<std::vector<std::string>>& rows)
{
    QStringList lines = {markdownRow(head, true),
                         QLatin1Char('|') + QStringLiteral("---|").repeated(qsizetype(head.size()))};
    for (const std::vector<std::string>& row : rows) {
        if (row.empty())
            return {};
        lines.append(markdownRow(row, false));
    }
    return lines;
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

std::vector<double> PairReporter::timesOf(const std::string& name, PairList::Clock clock) const
{
    const auto found = m_times.find(name);
    if (found == m_times.end())
        return {};
    const bool isProcessorTime = clock == PairList::Clock::Cpu || clock == PairList::Clock::Process;
    return isProcessorTime ? found->second.cpu : found->second.wall;
}

PairReporter::Row PairReporter::pairRow(const PairList::Pair& pair) const
{
    const std::vector<double> ourTimes = timesOf(pair.name + "/ours", pair.clock);
    const std::vector<double> floorTimes = timesOf(pair.name + "/floor", pair.clock);
    const double ours = Statistics::median(ourTimes);
    const double floor = Statistics::median(floorTimes);
    if (ours <= 0 || floor <= 0)
        return {};
    const double ratio = ours / floor;
    const bool isReached =
        (pair.aim <= 0 || ratio <= pair.aim) && (pair.limit <= 0 || ours * MILLISECONDS <= pair.limit);
    return {pair.name,
            clockName(pair.clock),
            milliseconds(ours),
            percent(Statistics::spread(ourTimes)),
            milliseconds(floor),
            percent(Statistics::spread(floorTimes)),
            formatted("%.2f", ratio),
            aimOf(pair),
            isReached ? "" : MISSED};
}

PairReporter::Row PairReporter::growthRow(const PairList::Growth& growth) const
{
    std::string sizes;
    std::string times;
    std::vector<std::pair<double, double>> points;
    for (const long size : growth.sizes) {
        const double time = Statistics::median(timesOf(PairList::nameOf(growth, size), growth.clock));
        if (time <= 0)
            return {};
        points.emplace_back(size, time);
        sizes += (sizes.empty() ? "" : ", ") + std::to_string(size);
        times += (times.empty() ? "" : ", ") + milliseconds(time);
    }
    const double exponent = Statistics::growthExponent(points);
    return {growth.name,
            clockName(growth.clock),
            sizes + ' ' + growth.unit,
            times,
            formatted("%.2f", exponent),
            formatted("%.3g", growth.aim),
            exponent <= growth.aim ? "" : MISSED};
}

void PairReporter::print(const Row& row)
{
    std::ostream& out = GetOutputStream();
    out << std::left << std::setw(NAME_WIDTH) << row.front();
    for (auto cell = row.begin() + 1; cell != row.end(); ++cell)
        out << "  " << std::right << std::setw(CELL_WIDTH - 2) << *cell;
    out << "\n";
}

void PairReporter::Finalize()
{
    std::ostream& out = GetOutputStream();
    const auto printAll = [&](const Row& head, const auto& entries, auto rowOf) {
        out << "\n";
        print(head);
        for (const auto& entry : entries) {
            const Row row = (this->*rowOf)(entry);
            if (row.empty())
                continue;
            print(row);
            m_missed += row.back() == MISSED ? 1 : 0;
        }
    };
    printAll(PAIR_HEAD, m_pairs.pairs(), &PairReporter::pairRow);
    printAll(GROWTH_HEAD, m_pairs.growths(), &PairReporter::growthRow);
    out << std::flush;
}

std::size_t PairReporter::repetitions() const
{
    std::size_t most = 0;
    for (const auto& [name, times] : m_times)
        most = std::max(most, times.wall.size());
    return most;
}

QStringList PairReporter::pairTable() const
{
    std::vector<Row> rows;
    for (const PairList::Pair& pair : m_pairs.pairs())
        rows.push_back(pairRow(pair));
    return markdown(PAIR_HEAD, rows);
}

QStringList PairReporter::growthTable() const
{
    std::vector<Row> rows;
    for (const PairList::Growth& growth : m_pairs.growths())
        rows.push_back(growthRow(growth));
    return markdown(GROWTH_HEAD, rows);
}

#include "bench/MachineLoad.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <fstream>
#include <sstream>
#include <sys/resource.h>
#include <unistd.h>

namespace
{

// The services of an idle machine and interrupts stay below this.
constexpr double BUSY = 0.03;
constexpr double STOLEN = 0.01;
constexpr double PERCENT = 100;

MachineLoad::Ticks readMachine()
{
    std::ifstream stat("/proc/stat");
    std::string line;
    std::getline(stat, line);
    return MachineLoad::parse(line);
}

// Returns the ticks that this process used, and its child processes that have ended.
double ownTicks()
{
    constexpr double MICROSECONDS = 1e6;
    double seconds = 0;
    for (const auto who : {RUSAGE_SELF, RUSAGE_CHILDREN}) {
        rusage usage{};
        getrusage(who, &usage);
        for (const timeval& time : {usage.ru_utime, usage.ru_stime})
            seconds += static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / MICROSECONDS;
    }
    return seconds * static_cast<double>(sysconf(_SC_CLK_TCK));
}

} // namespace

MachineLoad::MachineLoad() : m_before(readMachine()), m_own(ownTicks())
{
}

MachineLoad::Shares MachineLoad::shares() const
{
    return sharesBetween(m_before, readMachine(), ownTicks() - m_own);
}

MachineLoad::Ticks MachineLoad::parse(std::string_view stat)
{
    enum { User, Nice, System, Idle, WaitsForDisk, Interrupt, SoftInterrupt, Stolen, Columns };
    std::istringstream columns{std::string(stat)};
    std::string name;
    columns >> name;
    std::array<double, Columns> values{};
    for (double& value : values)
        if (!(columns >> value))
            break;
    Ticks ticks;
    for (const int column : {User, Nice, System, Interrupt, SoftInterrupt})
        ticks.used += values[static_cast<std::size_t>(column)];
    ticks.idle = values[Idle] + values[WaitsForDisk];
    ticks.stolen = values[Stolen];
    return ticks;
}

MachineLoad::Shares MachineLoad::sharesBetween(const Ticks& before, const Ticks& after, double ownTicks)
{
    const double used = after.used - before.used;
    const double stolen = after.stolen - before.stolen;
    const double all = used + stolen + after.idle - before.idle;
    if (all <= 0)
        return {};
    return {std::clamp((used - ownTicks) / all, 0.0, 1.0), std::clamp(stolen / all, 0.0, 1.0)};
}

bool MachineLoad::isBusy(const Shares& shares)
{
    return shares.others > BUSY || shares.stolen > STOLEN;
}

std::string MachineLoad::describe(const Shares& shares)
{
    std::array<char, 200> text{};
    std::snprintf(text.data(), text.size(),
                  "Other programs used %.1f %% of the processors, the machine's host took %.1f %%: %s.",
                  shares.others * PERCENT, shares.stolen * PERCENT,
                  isBusy(shares) ? "a busy machine, whose times are not to be believed" : "a quiet machine");
    return text.data();
}

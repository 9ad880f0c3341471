#pragma once

#include <string>
#include <string_view>

// Finds out how much of the processors was used by other programs during a measurement, since these make its
// times unreliable.
class MachineLoad
{
public:
    // Processor time of the whole machine since its start, in ticks of sysconf(_SC_CLK_TCK).
    struct Ticks {
        double used = 0;   // by all programs and the kernel
        double idle = 0;   // idle, or waiting for the disk
        double stolen = 0; // taken by the machine's host
    };
    // Shares of all processors, from 0 to 1.
    struct Shares {
        double others = 0; // programs other than the measured one and its child processes
        double stolen = 0;
    };

    // Begins the measurement.
    MachineLoad();

    // Returns the shares since the beginning. Child processes count as own as soon as they were waited for.
    Shares shares() const;

    // Reads the first line of /proc/stat. What is missing or is not a number counts as 0.
    static Ticks parse(std::string_view stat);
    // Returns the shares of the time between two readings, of which this program used ownTicks.
    static Shares sharesBetween(const Ticks& before, const Ticks& after, double ownTicks);
    // Returns whether the shares are so large that times are not to be believed.
    static bool isBusy(const Shares& shares);
    // Returns a sentence with both shares, for example "Other programs used 0.4 % of the processors, ...".
    static std::string describe(const Shares& shares);

private:
    Ticks m_before;
    double m_own; // ticks
};

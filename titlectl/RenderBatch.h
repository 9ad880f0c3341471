#pragma once

#include "titlectl/CommandOption.h"
#include "titlectl/RenderJob.h"

#include <QList>
#include <QString>
#include <QStringList>
#include <functional>
#include <optional>

// Renders a number of titles: one after the other, or in several processes. GUI thread only.
class RenderBatch
{
public:
    static constexpr int MOST_PROCESSES = 64;
    static const QString JOBS; // name of the option for the number of processes

    RenderBatch() = delete;

    static CommandOption jobsOption();
    // Returns the number of processes for a value of the option, one for each processor if it is empty;
    // nothing for a text that is not such a number.
    static std::optional<int> processesOf(const QString& jobs);

    // Returns what went wrong with each title, or empty strings. Calls oneDone after each, in any order.
    static QStringList run(const QList<RenderJob>& jobs, int processes, const std::function<void()>& oneDone);
};

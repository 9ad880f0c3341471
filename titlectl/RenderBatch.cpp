#include "titlectl/RenderBatch.h"

#include "titlectl/RenderWorkers.h"
#include "titlectl/TitleRenderer.h"

#include <QCoreApplication>
#include <QThread>
#include <algorithm>

const QString RenderBatch::JOBS = QStringLiteral("jobs");

CommandOption RenderBatch::jobsOption()
{
    return {JOBS, QStringLiteral("N"), QStringLiteral("use N processes; without it one for each processor")};
}

std::optional<int> RenderBatch::processesOf(const QString& jobs)
{
    if (jobs.isEmpty())
        return std::max(QThread::idealThreadCount(), 1);
    bool isNumber = false;
    const int number = jobs.toInt(&isNumber);
    return isNumber && number >= 1 && number <= MOST_PROCESSES ? std::optional<int>(number) : std::nullopt;
}

QStringList RenderBatch::run(const QList<RenderJob>& jobs, int processes,
                             const std::function<void()>& oneDone)
{
    QStringList errors(jobs.size());
    const auto isDone = [&](qsizetype job, const QString& error) {
        errors[job] = error;
        oneDone();
    };
    if (processes > 1 && jobs.size() > 1) {
        RenderWorkers(QCoreApplication::applicationFilePath(), processes).run(jobs, isDone);
    } else {
        TitleRenderer renderer;
        for (qsizetype i = 0; i < jobs.size(); ++i)
            isDone(i, renderer.render(jobs.at(i)));
    }
    return errors;
}

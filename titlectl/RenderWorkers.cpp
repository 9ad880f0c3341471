#include "titlectl/RenderWorkers.h"

#include "titlectl/RenderWorker.h"

#include <QProcess>
#include <QStringList>
#include <algorithm>
#include <utility>

RenderWorkers::RenderWorkers(QString program, int count) : m_program(std::move(program)), m_count(count)
{
}

RenderWorkers::~RenderWorkers() = default;

void RenderWorkers::run(const QList<RenderJob>& jobs, const Done& done)
{
    m_jobs = &jobs;
    m_done = done;
    m_next = 0;
    m_finished = 0;
    for (qsizetype i = 0; i < std::min<qsizetype>(m_count, jobs.size()); ++i) {
        m_workers.push_back(std::make_unique<Worker>());
        start(*m_workers.back());
    }
    if (m_finished < jobs.size())
        m_loop.exec();
    for (const std::unique_ptr<Worker>& worker : m_workers) {
        worker->process->disconnect(this);
        worker->process->closeWriteChannel();
        worker->process->waitForFinished(-1); // until the pictures are on the disk
    }
    m_workers.clear();
    m_jobs = nullptr;
}

void RenderWorkers::start(Worker& worker)
{
    if (worker.process) {
        worker.process->disconnect(this);
        worker.process.release()->deleteLater(); // it may be the caller
    }
    worker.process = std::make_unique<QProcess>();
    worker.process->setProcessChannelMode(QProcess::ForwardedErrorChannel);
    connect(worker.process.get(), &QProcess::readyReadStandardOutput, this,
            [this, &worker] { readAnswers(worker); });
    connect(worker.process.get(), &QProcess::finished, this, [this, &worker] { workerEnded(worker); });
    connect(
        worker.process.get(), &QProcess::errorOccurred, this,
        [this, &worker](QProcess::ProcessError error) {
            if (error == QProcess::FailedToStart) // no other error comes without finished()
                workerEnded(worker);
        },
        Qt::QueuedConnection);
    worker.process->start(m_program, {RenderWorker::COMMAND});
    giveNext(worker);
}

void RenderWorkers::giveNext(Worker& worker)
{
    if (m_next >= m_jobs->size())
        return;
    worker.job = m_next++;
    worker.process->write(m_jobs->at(worker.job).toLine());
}

void RenderWorkers::readAnswers(Worker& worker)
{
    while (worker.process->canReadLine()) {
        finish(worker, QString::fromUtf8(worker.process->readLine()).trimmed());
        giveNext(worker);
    }
}

void RenderWorkers::workerEnded(Worker& worker)
{
    finish(worker, QStringLiteral("the process that rendered the title has ended"));
    if (m_next < m_jobs->size())
        start(worker);
}

void RenderWorkers::finish(Worker& worker, const QString& error)
{
    const qsizetype job = std::exchange(worker.job, -1);
    if (job < 0)
        return;
    m_done(job, error);
    if (++m_finished == m_jobs->size())
        m_loop.quit();
}

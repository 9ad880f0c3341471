#pragma once

#include "titlectl/RenderJob.h"

#include <QEventLoop>
#include <QList>
#include <QObject>
#include <functional>
#include <memory>
#include <vector>

class QProcess;

// Renders titles in several processes of this program. Text is laid out in the GUI thread only, so threads
// would wait for each other; and a title that ends a process costs only that title.
class RenderWorkers : public QObject
{
    Q_OBJECT

public:
    // Called with the index of a job and what went wrong, or an empty string.
    using Done = std::function<void(qsizetype job, const QString& error)>;

    // program is the path of titlectl.
    RenderWorkers(QString program, int count);
    ~RenderWorkers() override;

    // Renders all jobs; each is reported once, in any order. Runs an event loop until the last one is done.
    void run(const QList<RenderJob>& jobs, const Done& done);

private:
    struct Worker {
        std::unique_ptr<QProcess> process;
        qsizetype job = -1; // the job at hand, or -1
    };

    void start(Worker& worker);
    void giveNext(Worker& worker);
    void readAnswers(Worker& worker);
    void workerEnded(Worker& worker);
    void finish(Worker& worker, const QString& error);

    QString m_program;
    int m_count;
    std::vector<std::unique_ptr<Worker>> m_workers;
    const QList<RenderJob>* m_jobs = nullptr; // during run()
    Done m_done;
    qsizetype m_next = 0;
    qsizetype m_finished = 0;
    QEventLoop m_loop;
};

#pragma once

#include "document/CanvasController.h"

#include <QMutex>
#include <QThread>
#include <QWaitCondition>
#include <deque>
#include <memory>

class Archive;

// Writes title files in its own thread, in the order of the calls.
class SceneThread : public QThread
{
    Q_OBJECT

public:
    explicit SceneThread(QObject* parent = nullptr);
    // Drops the queued jobs, waits for the current one and ends the thread.
    ~SceneThread() override;

    // Queues a copy of the record, which is written to the record's own path. Does nothing for null. GUI
    // thread.
    void addArchive(const Archive* archive);

protected:
    void run() override;

private:
    CanvasController m_controller;
    QMutex m_mutex; // guards the queue and the stop flag
    QWaitCondition m_condition;
    std::deque<std::unique_ptr<Archive>> m_archives;
    bool m_stop = false;
};

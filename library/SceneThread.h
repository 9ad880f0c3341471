// Writes title files off the GUI thread, in the order in which they were asked for.
#pragma once

#include "document/CanvasController.h"

#include <QMutex>
#include <QThread>
#include <QWaitCondition>
#include <deque>
#include <memory>

class Archive;

class SceneThread : public QThread
{
    Q_OBJECT

public:
    explicit SceneThread(QObject* parent = nullptr);
    // Drops what is still queued, lets the job at hand finish and ends the thread.
    ~SceneThread() override;

    // Queues a copy of the record; it is written to the record's own path. Null does nothing. GUI thread.
    void addArchive(const Archive* archive);

protected:
    void run() override;

private:
    CanvasController mController;
    QMutex mMutex; // guards the queue and the stop flag
    QWaitCondition mCondition;
    std::deque<std::unique_ptr<Archive>> mArchives;
    bool mStop = false;
};

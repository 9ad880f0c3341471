#pragma once

#include "document/Archive.h"
#include "document/ArchiveController.h"

#include <QList>
#include <QMutex>
#include <QString>
#include <QThread>
#include <atomic>

// Loads the titles of a folder outside the GUI thread.
class ArchiveInitThread : public QThread
{
    Q_OBJECT

public:
    explicit ArchiveInitThread(QString folder, QObject* parent = nullptr);
    // Waits for the thread and deletes records that no receiver has taken. The receiver of the signal must be
    // able to take it meanwhile, see cancel().
    ~ArchiveInitThread() override;

    // Stops the announcement of the titles. The signal may be on its way already: the receiver has to go on
    // handling events until the thread has finished. Any thread.
    void cancel() { m_cancelled = true; }

Q_SIGNALS:
    // Passes the records to the receiver. Emitted by this thread, to be connected with
    // Qt::BlockingQueuedConnection.
    void threadGetArchiveListFinished(QList<Archive*> archives);

protected:
    void run() override;

private:
    ArchiveController m_controller;
    QString m_folder;
    QMutex m_mutex; // guards m_archives
    QList<Archive*> m_archives;
    std::atomic<bool> m_cancelled{false};
};

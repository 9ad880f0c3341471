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
    void cancel() { mCancelled = true; }

Q_SIGNALS:
    // Passes the records to the receiver. Emitted by this thread, to be connected with
    // Qt::BlockingQueuedConnection.
    void threadGetArchiveListFinished(QList<Archive*> archives);

protected:
    void run() override;

private:
    ArchiveController mController;
    QString mFolder;
    QMutex mMutex; // guards mArchives
    QList<Archive*> mArchives;
    std::atomic<bool> mCancelled{false};
};

// Loads the titles of a folder off the GUI thread.
#pragma once

#include "document/Archive.h"
#include "document/ArchiveController.h"

#include <QList>
#include <QMutex>
#include <QString>
#include <QThread>
#include <atomic>

class ArchiveInitThread : public QThread
{
    Q_OBJECT

public:
    explicit ArchiveInitThread(QString folder, QObject* parent = nullptr);
    // Waits for the thread; records that nobody took are deleted. Must not run while the receiver of the
    // signal is kept from taking it, see cancel().
    ~ArchiveInitThread() override;

    // From now on the titles are not announced any more. One announcement may be under way already: the
    // receiver has to go on handling events until the thread has finished. Any thread.
    void cancel() { mCancelled = true; }

Q_SIGNALS:
    // The records pass to the receiver. Sent from this thread, to be connected with
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

#include "library/ArchiveInitThread.h"

#include "document/Archive.h"
#include "support/AlternateStack.h"

#include <QMetaMethod>
#include <QMutexLocker>
#include <utility>

ArchiveInitThread::ArchiveInitThread(QString folder, QObject* parent)
    : QThread(parent), mFolder(std::move(folder))
{
}

ArchiveInitThread::~ArchiveInitThread()
{
    cancel();
    wait();
    QMutexLocker lock(&mMutex);
    qDeleteAll(mArchives);
    mArchives.clear();
}

void ArchiveInitThread::run()
{
    AlternateStack::useInThisThread();
    QList<Archive*> archives = mController.getArchiveList(mFolder);
    {
        // Unlocked before the signal is emitted, which blocks until the GUI thread has handled it.
        QMutexLocker lock(&mMutex);
        const QMetaMethod finished =
            QMetaMethod::fromSignal(&ArchiveInitThread::threadGetArchiveListFinished);
        if (mCancelled || !isSignalConnected(finished)) {
            mArchives = archives;
            return;
        }
    }
    Q_EMIT threadGetArchiveListFinished(archives);
}

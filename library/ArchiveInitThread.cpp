#include "library/ArchiveInitThread.h"

#include "document/Archive.h"
#include "support/AlternateStack.h"

#include <QMetaMethod>
#include <QMutexLocker>
#include <utility>

ArchiveInitThread::ArchiveInitThread(QString folder, QObject* parent)
    : QThread(parent), m_folder(std::move(folder))
{
}

ArchiveInitThread::~ArchiveInitThread()
{
    cancel();
    wait();
    QMutexLocker lock(&m_mutex);
    qDeleteAll(m_archives);
    m_archives.clear();
}

void ArchiveInitThread::run()
{
    AlternateStack::useInThisThread();
    QList<Archive*> archives = m_controller.getArchiveList(m_folder);
    {
        // Unlocked before the signal is emitted, which blocks until the GUI thread has handled it.
        QMutexLocker lock(&m_mutex);
        const QMetaMethod finished =
            QMetaMethod::fromSignal(&ArchiveInitThread::threadGetArchiveListFinished);
        if (m_cancelled || !isSignalConnected(finished)) {
            m_archives = archives;
            return;
        }
    }
    Q_EMIT threadGetArchiveListFinished(archives);
}

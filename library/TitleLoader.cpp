#include "library/TitleLoader.h"

#include "document/Archive.h"
#include "library/ArchiveInitThread.h"

#include <QCoreApplication>
#include <QEvent>

namespace
{

const int POLL = 1; // ms

} // namespace

TitleLoader::TitleLoader() = default;

TitleLoader::~TitleLoader()
{
    end();
}

void TitleLoader::load(const QString& folder)
{
    end();
    m_thread = std::make_unique<ArchiveInitThread>(folder);
    connect(m_thread.get(), &ArchiveInitThread::threadGetArchiveListFinished, this, &TitleLoader::takeTitles,
            Qt::BlockingQueuedConnection);
    m_thread->start(QThread::InheritPriority);
}

// The thread may be blocked until this thread has taken its titles, so these are accepted and dropped.
void TitleLoader::end()
{
    if (!m_thread)
        return;
    m_thread->cancel();
    m_isEnding = true;
    while (!m_thread->wait(POLL))
        QCoreApplication::sendPostedEvents(this, QEvent::MetaCall);
    m_isEnding = false;
    m_thread.reset();
}

void TitleLoader::takeTitles(const QList<Archive*>& archives)
{
    if (m_isEnding)
        qDeleteAll(archives);
    else
        Q_EMIT loaded(archives);
}

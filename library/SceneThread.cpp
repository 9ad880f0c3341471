#include "library/SceneThread.h"

#include "document/Archive.h"
#include "support/AlternateStack.h"

#include <QMutexLocker>

SceneThread::SceneThread(QObject* parent) : QThread(parent)
{
    start(QThread::InheritPriority);
}

SceneThread::~SceneThread()
{
    {
        QMutexLocker lock(&m_mutex);
        m_archives.clear();
        m_stop = true;
        m_condition.wakeAll();
    }
    wait();
}

void SceneThread::addArchive(const Archive* archive)
{
    if (!archive)
        return;
    auto copy = std::make_unique<Archive>(*archive);
    QMutexLocker lock(&m_mutex);
    m_archives.push_back(std::move(copy));
    m_condition.wakeOne();
}

void SceneThread::run()
{
    AlternateStack::useInThisThread();
    for (;;) {
        std::unique_ptr<Archive> archive;
        {
            QMutexLocker lock(&m_mutex);
            while (m_archives.empty() && !m_stop)
                m_condition.wait(&m_mutex);
            if (m_stop)
                return;
            archive = std::move(m_archives.front());
            m_archives.pop_front();
        }
        m_controller.saveArchiveChange(QString::fromStdString(archive->getPath()), archive.get());
    }
}

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
        QMutexLocker lock(&mMutex);
        mArchives.clear();
        mStop = true;
        mCondition.wakeAll();
    }
    wait();
}

void SceneThread::addArchive(const Archive* archive)
{
    if (!archive)
        return;
    auto copy = std::make_unique<Archive>(*archive);
    QMutexLocker lock(&mMutex);
    mArchives.push_back(std::move(copy));
    mCondition.wakeOne();
}

void SceneThread::run()
{
    AlternateStack::useInThisThread();
    for (;;) {
        std::unique_ptr<Archive> archive;
        {
            QMutexLocker lock(&mMutex);
            while (mArchives.empty() && !mStop)
                mCondition.wait(&mMutex);
            if (mStop)
                return;
            archive = std::move(mArchives.front());
            mArchives.pop_front();
        }
        mController.saveArchiveChange(QString::fromStdString(archive->getPath()), archive.get());
    }
}

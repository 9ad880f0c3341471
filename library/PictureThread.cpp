#include "library/PictureThread.h"

#include "document/Archive.h"
#include "document/ITitleChangeReporter.h"
#include "document/ImageResizer.h"
#include "library/TitlerUtility.h"

#include <QMutexLocker>
#include <string>

const QSize PictureThread::THUMBNAIL_SMALL_SIZE(240, 135);
const QSize PictureThread::THUMBNAIL_MIDDLE_SIZE(960, 540);

PictureThread::PictureThread(QObject* parent) : QThread(parent)
{
    start(QThread::InheritPriority);
}

PictureThread::~PictureThread()
{
    {
        QMutexLocker lock(&mMutex);
        mUnfinished -= static_cast<int>(mJobs.size());
        mJobs.clear();
        mStop = true;
        mCondition.wakeAll();
    }
    wait();
}

void PictureThread::addArchive(const Archive* archive, QList<QImage> images)
{
    if (!archive || images.size() < 2)
        return;
    Job job{std::make_unique<Archive>(*archive), images.at(0), images.at(1)};
    QMutexLocker lock(&mMutex);
    ++mUnfinished;
    mJobs.push_back(std::move(job));
    mCondition.wakeOne();
}

bool PictureThread::isThreadWaiting() const
{
    return mUnfinished == 0;
}

void PictureThread::run()
{
    for (;;) {
        Job job;
        {
            QMutexLocker lock(&mMutex);
            while (mJobs.empty() && !mStop)
                mCondition.wait(&mMutex);
            if (mStop)
                return;
            job = std::move(mJobs.front());
            mJobs.pop_front();
        }
        saveArchiveThumnail(*job.archive, job.big, job.middle);
        job = Job(); // the images go before the job counts as finished
        --mUnfinished;
    }
}

#include "library/PictureThread.h"

#include "document/Archive.h"
#include "document/ITitleChangeReporter.h"
#include "library/PictureFiles.h"
#include "support/AlternateStack.h"
#include "support/RefusedWrites.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
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
        QMutexLocker lock(&m_mutex);
        m_unfinished -= static_cast<int>(m_jobs.size());
        m_jobs.clear();
        m_stop = true;
        m_condition.wakeAll();
    }
    wait();
}

void PictureThread::addArchive(const Archive* archive, QList<QImage> images)
{
    if (!archive || images.size() < 2)
        return;
    Job job{std::make_unique<Archive>(*archive), images.at(0), images.at(1), hasTitle(*archive)};
    QMutexLocker lock(&m_mutex);
    ++m_unfinished;
    m_jobs.push_back(std::move(job));
    m_condition.wakeOne();
}

void PictureThread::folderRenamed(const QString& before, const QString& after)
{
    QMutexLocker lock(&m_mutex);
    for (Job& job : m_jobs)
        moveToFolder(*job.archive, before, after);
}

void PictureThread::moveToFolder(Archive& archive, const QString& before, const QString& after)
{
    const QFileInfo title(QString::fromStdString(archive.getPath()));
    if (QDir::cleanPath(title.path()) == before)
        archive.setPath((after + QLatin1Char('/') + title.fileName()).toStdString());
}

bool PictureThread::isThreadWaiting() const
{
    return m_unfinished == 0;
}

void PictureThread::waitForProgress(int longest)
{
    QMutexLocker lock(&m_mutex);
    if (m_unfinished > 0)
        m_progress.wait(&m_mutex, static_cast<unsigned long>(longest));
}

void PictureThread::run()
{
    AlternateStack::useInThisThread();
    for (;;) {
        Job job;
        {
            QMutexLocker lock(&m_mutex);
            while (m_jobs.empty() && !m_stop)
                m_condition.wait(&m_mutex);
            if (m_stop)
                return;
            job = std::move(m_jobs.front());
            m_jobs.pop_front();
        }
        saveArchiveThumnail(*job.archive, job.big, job.middle);
        // A deletion removes the title file first, then the pictures that exist at that time; those written
        // since are removed here. If the whole folder is missing, nothing was written, and the kept pictures
        // are moved or dropped with the folder.
        if (job.hadTitle && !hasTitle(*job.archive))
            removePictures(*job.archive);
        job = Job(); // frees the images before the job counts as finished
        QMutexLocker lock(&m_mutex);
        --m_unfinished;
        m_progress.wakeAll();
    }
}

bool PictureThread::hasTitle(const Archive& archive)
{
    return QFile::exists(QString::fromStdString(archive.getPath()));
}

void PictureThread::removePictures(const Archive& archive)
{
    for (const std::string& name : {archive.getThumbnailBig(), archive.getThumbnailMiddle(),
                                    archive.getThumbnailBlack(), archive.getThumbnailSmall()}) {
        if (const QString path = PictureFiles::path(archive, name); !path.isEmpty()) {
            QFile::remove(path);
            if (QFileInfo(path).dir().exists())
                RefusedWrites::forget(path.toStdString());
        }
    }
}

void PictureThread::saveArchiveThumnail(const Archive& archive, const QImage& big, const QImage& middle)
{
    PictureFiles::write(archive, big, middle);
    if (ITitleChangeReporter* reporter = ITitleChangeReporter::instance())
        reporter->changeTitlerStatus(FileManagerDefine::TITLE_PICTURES_CHANGED,
                                     QString::fromStdString(archive.getPath()));
}

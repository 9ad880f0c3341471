#pragma once

#include <QImage>
#include <QList>
#include <QMutex>
#include <QSize>
#include <QThread>
#include <QWaitCondition>
#include <atomic>
#include <deque>
#include <memory>

class Archive;

// Writes the four pictures of each title in its own thread, in the order of the calls. Each file is replaced
// when the new one is complete; the disk may sync it later.
class PictureThread : public QThread
{
    Q_OBJECT

public:
    static const QSize THUMBNAIL_SMALL_SIZE;
    static const QSize THUMBNAIL_MIDDLE_SIZE;

    explicit PictureThread(QObject* parent = nullptr);
    // Drops the queued jobs, waits for the current one and ends the thread.
    ~PictureThread() override;

    // Queues one job with a copy of the record. The first image is the 1920x1080 picture, the second the
    // 960x540 one. Does nothing for a null record or fewer images. If the title is deleted before its
    // pictures are written, they are removed again. Pictures that cannot be written are kept by
    // RefusedWrites. GUI thread; never waits for a picture.
    void addArchive(const Archive* archive, QList<QImage> images);

    // Returns whether no job is queued or being written: false from the moment a job is queued until its
    // files are in place. Any thread.
    bool isThreadWaiting() const;

    // Returns the number of jobs queued or being written. Any thread.
    int unfinished() const { return m_unfinished; }

    // Waits until a job is finished, at most so many milliseconds; not at all without jobs. Any thread but
    // this one.
    void waitForProgress(int longest);

    // Redirects queued jobs for titles of a renamed folder to its new path. Any thread.
    void folderRenamed(const QString& before, const QString& after);

    // Changes the path of the record to the new folder if it is in the old one.
    static void moveToFolder(Archive& archive, const QString& before, const QString& after);

protected:
    void run() override;

private:
    struct Job {
        std::unique_ptr<Archive> archive;
        QImage big;
        QImage middle;
        bool hadTitle = false; // whether the title file existed when the job was queued
    };

    void saveArchiveThumnail(const Archive& archive, const QImage& big, const QImage& middle);
    static bool hasTitle(const Archive& archive);
    static void removePictures(const Archive& archive);

    QMutex m_mutex; // guards the queue and the stop flag
    QWaitCondition m_condition;
    QWaitCondition m_progress;
    std::deque<Job> m_jobs;
    bool m_stop = false;
    std::atomic<int> m_unfinished{0};
};

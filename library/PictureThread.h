// Writes the four pictures of a title off the GUI thread, in the order in which they were asked for. Each
// replaces the one before when it is complete; the disk may sync them later.
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

class PictureThread : public QThread
{
    Q_OBJECT

public:
    static const QSize THUMBNAIL_SMALL_SIZE;
    static const QSize THUMBNAIL_MIDDLE_SIZE;

    explicit PictureThread(QObject* parent = nullptr);
    // Drops what is still queued, lets the job at hand finish and ends the thread.
    ~PictureThread() override;

    // Queues one job; keeps a copy of the record. The first image is the 1920x1080 picture, the second the
    // 960x540 one. A null record or fewer images do nothing. A title that is deleted before its pictures are
    // in place keeps none of them. Pictures that the disk refuses are kept (RefusedWrites). GUI thread; never
    // waits for a picture.
    void addArchive(const Archive* archive, QList<QImage> images);

    // True when no job is queued or being written. From the moment a job is queued this is false until its
    // files are in place. Any thread.
    bool isThreadWaiting() const;

    // Jobs queued or being written. Any thread.
    int unfinished() const { return mUnfinished; }

    // Queued jobs for titles of the folder go to its new name. Any thread.
    void folderRenamed(const QString& before, const QString& after);

    // The record's files lie in the folder's new place, if they lay in it.
    static void moveToFolder(Archive& archive, const QString& before, const QString& after);

protected:
    void run() override;

private:
    struct Job {
        std::unique_ptr<Archive> archive;
        QImage big;
        QImage middle;
        bool hadTitle = false; // whether there was a title file when the job was queued
    };

    void saveArchiveThumnail(const Archive& archive, const QImage& big, const QImage& middle);
    static bool hasTitle(const Archive& archive);
    static void removePictures(const Archive& archive);

    QMutex mMutex; // guards the queue and the stop flag
    QWaitCondition mCondition;
    std::deque<Job> mJobs;
    bool mStop = false;
    std::atomic<int> mUnfinished{0};
};

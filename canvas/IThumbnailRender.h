#pragma once

#include <QImage>
#include <QObject>
#include <QString>
#include <QThread>

class Archive;

// Makes the pictures of a title. The scene owns one; without one the scene makes no pictures. GUI thread
// only; an implementation may write its files in a thread of its own.
class IThumbnailRender : public QObject
{
    Q_OBJECT
public:
    using QObject::QObject;

    // Makes the small picture for the list at once (bigSize false) or all picture files in the background
    // (bigSize true). The archive is read before the call returns; null does nothing.
    virtual void makeThumbnail(const Archive* archive, bool bigSize) = 0;
    // Call when a title that is shown begins to change: all its pictures will be made when it is left. An
    // implementation may begin with what takes long.
    virtual void expectPictures(const Archive& /*archive*/) {}
    // Returns whether all pictures are written.
    virtual bool makePictureThreadIsFinished() = 0;
    // Returns the number of titles whose pictures are not written yet. As long as it decreases, waiting makes
    // sense.
    virtual int unfinishedTitles() { return makePictureThreadIsFinished() ? 0 : 1; }
    // Waits until the pictures of another title are written, at most so many milliseconds.
    virtual void waitForProgress(int longest) { QThread::msleep(static_cast<unsigned long>(longest)); }
    // Call when a folder was renamed: its titles and the pictures still to be written belong to the new path.
    // Both paths without a "/" at the end.
    virtual void folderRenamed(const QString& /*before*/, const QString& /*after*/) {}

Q_SIGNALS:
    // Emitted when the list picture of the title at path is ready.
    void saveHalfThumbnailsOK(QString path, QImage image);
};

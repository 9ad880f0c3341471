#pragma once

#include <QImage>
#include <QObject>
#include <QString>

class Archive;

// Makes the pictures of a title. The scene owns one; where none is given the scene makes no pictures.
// GUI thread only; an implementation may write its files on a thread of its own.
class IThumbnailRender : public QObject
{
    Q_OBJECT
public:
    using QObject::QObject;

    // Small picture for the list (bigSize false, at once) or all picture files (bigSize true, in the
    // background). The archive is read before the call returns; null does nothing.
    virtual void makeThumbnail(const Archive* archive, bool bigSize) = 0;
    // True when no picture waits to be written.
    virtual bool makePictureThreadIsFinished() = 0;
    // Titles whose pictures are not written yet: while they become fewer, waiting is worth it.
    virtual int unfinishedTitles() { return makePictureThreadIsFinished() ? 0 : 1; }
    // Titles of the folder lie in another one now, under the same names; so do the pictures still to be
    // written. Both paths without a "/" at the end.
    virtual void folderRenamed(const QString& /*before*/, const QString& /*after*/) {}

Q_SIGNALS:
    // The list picture of the title at path is ready.
    void saveHalfThumbnailsOK(QString path, QImage image);
};

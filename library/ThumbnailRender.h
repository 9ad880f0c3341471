// Lays out a title in off-screen scenes and renders its pictures.
//
// The fast stage gives the list a fresh small picture at once and touches no disk. The slow stage renders the
// 1920x1080 picture and hands it to a thread that writes all four files; it runs when the title is left.
// GUI thread only; the files are written by the PictureThread.
#pragma once

#include "canvas/IThumbnailRender.h"
#include "library/PictureThread.h"

#include <QColor>
#include <QGraphicsScene>
#include <QImage>
#include <QList>
#include <QRect>
#include <QSize>
#include <atomic>
#include <deque>
#include <future>
#include <memory>

class Archive;
class GraphicsPixmap;
class GraphicsText;

class ThumbnailRender : public IThumbnailRender
{
    Q_OBJECT

public:
    static const QSize THUMBNAIL_BIG_SIZE;
    static const QSize THUMBNAIL_MID_SIZE;
    static const QSize THUMBNAIL_MIDDLE_SIZE;
    static const QSize THUMBNAIL_SMALL_SIZE;
    static const QSize THUMBNAIL_BLACK_SIZE;
    static const QRect SCENE_RECT_SIZE;
    static const QRect BIG_SIZE_SCENE_RECT_SIZE;
    static const QColor DROP_SHADOW_COLOR;

    explicit ThumbnailRender(QObject* parent = nullptr);
    // Pictures that are queued but not begun are not written any more.
    ~ThumbnailRender() override;

    // False: the fast stage, which ends in saveHalfThumbnailsOK. True: the slow stage, which queues the
    // files: the background is decoded by another thread, and the picture drawn in a later turn of the event
    // loop. Null does nothing. The record is only read.
    void makeThumbnail(const Archive* archive, bool bigSize) override;
    // True when every queued picture has been written. What is still to be drawn is drawn first, so that
    // callers may wait without an event loop.
    bool makePictureThreadIsFinished() override;
    int unfinishedTitles() override;
    void folderRenamed(const QString& before, const QString& after) override;

    // Hooks for what a subclass may keep beside the scenes.
    virtual void clearBigSizeCanvasSceneResource();
    virtual void clearMiddleSizeCanvasSceneResource();

private:
    void makeMiddleAndSmallSizeThumbnail(const Archive& archive);
    void makeBigSizeThumbnail(const Archive& archive);
    void createMiddleSizeCanvasSceneUsingArchiveData(const Archive& archive);
    void createBigSizeCanvasSceneUsingArchiveData(const Archive& archive, const QImage& background);
    void drawDecodedBigPictures();
    void drawNextBigPicture();
    QImage renderMiddleSizeCanvasScene();
    QList<QImage> renderBigAndMiddleSizeCanvasScene();
    void saveMiddleSizeThumnail(const Archive& archive, const QImage& image);
    void saveBigSizeThumnail(const Archive& archive, const QList<QImage>& images);
    void clearMiddleSizeCanvasScene();
    void clearBigSizeCanvasScene();

    // A title whose big picture is to be drawn once its background is decoded.
    struct BigPicture {
        std::unique_ptr<Archive> archive;
        bool hadTitle = false; // whether there was a title file when the job was queued
        QImage background;
        std::atomic<bool> isDecoded = false; // the background may be used
        std::future<void> decoder;
    };

    std::deque<std::unique_ptr<BigPicture>> mBigPictures;
    QList<GraphicsText*> mTexts; // of the last fast layout, owned by its scene
    QGraphicsScene mMiddleScene;
    QGraphicsScene mBigScene;
    GraphicsPixmap* mMiddleBackground = nullptr; // owned by its scene
    GraphicsPixmap* mBigBackground = nullptr;    // owned by its scene
    PictureThread mPictureThread;                // last: ends before the scenes go
};

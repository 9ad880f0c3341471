#pragma once

#include "canvas/IThumbnailRender.h"
#include "library/DecodedBackground.h"
#include "library/PictureThread.h"
#include "library/RasterScene.h"

#include <QColor>
#include <QGraphicsScene>
#include <QImage>
#include <QList>
#include <QRect>
#include <QSize>
#include <QTimer>
#include <deque>
#include <functional>
#include <memory>

class Archive;
class GraphicsPixmap;
class GraphicsText;

// Lays out a title in off-screen scenes and renders its pictures.
//
// The fast stage renders a small picture for the list at once, without writing files. The slow stage renders
// the 1920x1080 picture and passes it to a thread that writes all four files; it is used when another title
// is shown. GUI thread only; the files are written by the PictureThread.
//
// The decoded background that was drawn last, or will be drawn next, is kept for the next pictures until no
// pictures have been made or expected for a while.
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
    // Drops pictures that are queued and not begun.
    ~ThumbnailRender() override;

    // Makes the pictures of the title. With false runs the fast stage, which emits saveHalfThumbnailsOK().
    // With true runs the slow stage, which queues the files: another thread decodes the background, and the
    // picture is drawn in a later turn of the event loop. Null does nothing. The record is not changed.
    void makeThumbnail(const Archive* archive, bool bigSize) override;
    // Has another thread decode the background.
    void expectPictures(const Archive& archive) override;
    // Returns whether every queued picture is written. Draws the pictures that are still to be drawn first,
    // so that callers can wait without an event loop.
    bool makePictureThreadIsFinished() override;
    int unfinishedTitles() override;
    void waitForProgress(int longest) override;
    void folderRenamed(const QString& before, const QString& after) override;

    // Draws the 1920x1080 and the 960x540 picture of the title at once, as the slow stage does, and returns
    // them without writing files.
    QList<QImage> drawPictures(const Archive& archive);

    // Called before the scenes are cleared. For subclasses with resources of their own.
    virtual void clearBigSizeCanvasSceneResource();
    virtual void clearMiddleSizeCanvasSceneResource();

private:
    void makeMiddleAndSmallSizeThumbnail(const Archive& archive);
    void makeBigSizeThumbnail(const Archive& archive);
    void createMiddleSizeCanvasSceneUsingArchiveData(const Archive& archive);
    QList<QImage> drawPictures(const Archive& archive, const QPixmap& background);
    void keepBackground(const Archive& archive, std::function<void()> decoded);
    void giveBackMemory();
    void announceDecoded();
    void drawDecodedBigPictures();
    void drawNextBigPicture();
    QImage renderMiddleSizeCanvasScene();
    QList<QImage> renderBigAndMiddleSizeCanvasScene();
    void saveMiddleSizeThumnail(const Archive& archive, const QImage& image);
    void saveBigSizeThumnail(const Archive& archive, const QList<QImage>& images);
    void clearMiddleSizeCanvasScene();
    void clearBigSizeCanvasScene();

    // A title whose big picture is drawn after its background has been decoded.
    struct BigPicture {
        std::unique_ptr<Archive> archive;
        bool hadTitle = false; // whether the title file existed when the job was queued
        std::shared_ptr<DecodedBackground> background; // null for a title without one

        bool isDecoded() const { return !background || background->isDone(); }
    };

    std::deque<std::unique_ptr<BigPicture>> m_bigPictures;
    std::shared_ptr<DecodedBackground> m_background; // of the latest title; null for one without
    QTimer m_idleTime{this};
    QGraphicsScene m_middleScene;
    RasterScene m_bigScene;
    GraphicsPixmap* m_middleBackground = nullptr; // owned by m_middleScene
    PictureThread m_pictureThread;                // last, so that it is destroyed before the scenes
};

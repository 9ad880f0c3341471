#include "library/ThumbnailRender.h"

#include "canvas/GraphicsPixmap.h"
#include "canvas/GraphicsText.h"
#include "document/Archive.h"
#include "document/HalfPicture.h"
#include "document/RasterPool.h"
#include "document/TText.h"
#include "support/LogManager.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QGraphicsDropShadowEffect>
#include <QPainter>
#include <QPixmap>
#include <QPoint>
#include <string>
#include <utility>

const QSize ThumbnailRender::THUMBNAIL_BIG_SIZE(1920, 1080);
const QSize ThumbnailRender::THUMBNAIL_MID_SIZE(1280, 720);
const QSize ThumbnailRender::THUMBNAIL_MIDDLE_SIZE(960, 540);
const QSize ThumbnailRender::THUMBNAIL_SMALL_SIZE(240, 135);
const QSize ThumbnailRender::THUMBNAIL_BLACK_SIZE(240, 135);
const QRect ThumbnailRender::SCENE_RECT_SIZE(QPoint(0, 0), QPoint(1279, 719));
const QRect ThumbnailRender::BIG_SIZE_SCENE_RECT_SIZE(QPoint(0, 0), QPoint(1919, 1079));
const QColor ThumbnailRender::DROP_SHADOW_COLOR(0, 0, 0, 255);

namespace
{

const double CANVAS_RATIO = 2.0 / 3.0;

constexpr int IDLE_TIME = 60000; // ms until memory that is kept for the next pictures is given back

// Limits the bounding rectangles to the raster, so that a text far outside it takes no time to paint.
void limitTextsToRaster(const QGraphicsScene& scene)
{
    for (QGraphicsItem* item : scene.items())
        if (item->type() == GraphicsText::Type)
            static_cast<GraphicsText*>(item)->setBoundingRectFlag(true);
}

void logBoundingRect(const GraphicsText& text, int id)
{
    // The position in a damaged file may not fit into an integer.
    const QRectF rect = text.sceneBoundingRect();
    LOG_DEBUG_OPERATE(L"ThumbnailRender", 200,
                      QStringLiteral("text %1 boundingRect %2,%3 %4x%5")
                          .arg(id)
                          .arg(rect.x(), 0, 'f', 1)
                          .arg(rect.y(), 0, 'f', 1)
                          .arg(rect.width(), 0, 'f', 1)
                          .arg(rect.height(), 0, 'f', 1)
                          .toStdWString());
}

QImage renderScene(QGraphicsScene& scene, QSize size)
{
    QImage image = RasterPool::take(size);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    scene.render(&painter, QRectF(), QRectF(), Qt::KeepAspectRatio);
    return image;
}

} // namespace

ThumbnailRender::ThumbnailRender(QObject* parent) : IThumbnailRender(parent)
{
    m_middleScene.setSceneRect(SCENE_RECT_SIZE);
    // The scene is filled, rendered once and cleared, so an index would not pay off.
    m_middleScene.setItemIndexMethod(QGraphicsScene::NoIndex);
    m_idleTime.setSingleShot(true);
    m_idleTime.setInterval(IDLE_TIME);
    connect(&m_idleTime, &QTimer::timeout, this, &ThumbnailRender::giveBackMemory);
}

ThumbnailRender::~ThumbnailRender()
{
    m_bigPictures.clear(); // each job waits for its decoder
    m_background.reset();
    clearMiddleSizeCanvasScene();
    clearBigSizeCanvasScene();
}

void ThumbnailRender::makeThumbnail(const Archive* archive, bool bigSize)
{
    if (!archive)
        return;
    if (bigSize)
        makeBigSizeThumbnail(*archive);
    else
        makeMiddleAndSmallSizeThumbnail(*archive);
}

bool ThumbnailRender::makePictureThreadIsFinished()
{
    while (!m_bigPictures.empty())
        drawNextBigPicture();
    return m_pictureThread.isThreadWaiting();
}

int ThumbnailRender::unfinishedTitles()
{
    return static_cast<int>(m_bigPictures.size()) + m_pictureThread.unfinished();
}

void ThumbnailRender::waitForProgress(int longest)
{
    if (m_bigPictures.empty())
        m_pictureThread.waitForProgress(longest);
}

void ThumbnailRender::folderRenamed(const QString& before, const QString& after)
{
    for (const std::unique_ptr<BigPicture>& job : m_bigPictures)
        PictureThread::moveToFolder(*job->archive, before, after);
    m_pictureThread.folderRenamed(before, after);
}

void ThumbnailRender::makeMiddleAndSmallSizeThumbnail(const Archive& archive)
{
    createMiddleSizeCanvasSceneUsingArchiveData(archive);
    saveMiddleSizeThumnail(archive, renderMiddleSizeCanvasScene());
    clearMiddleSizeCanvasScene();
}

void ThumbnailRender::createMiddleSizeCanvasSceneUsingArchiveData(const Archive& archive)
{
    const QString background = archive.getFullPathOfBgResource();
    if (!background.isEmpty()) {
        m_middleBackground = new GraphicsPixmap(background);
        const QPixmap pixmap = m_middleBackground->pixmap();
        if (!pixmap.isNull())
            m_middleBackground->setPixmap(
                pixmap.scaled(THUMBNAIL_MID_SIZE, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
        m_middleScene.addItem(m_middleBackground);
        m_middleBackground->setPos(archive.getBgPointX(), archive.getBgPointY());
        m_middleBackground->setZValue(archive.getBgPointZ());
    }
    for (TText* record : archive.text()) {
        auto* text = new GraphicsText(record, record->getTextObjectID());
        text->setRadio(CANVAS_RATIO, false);
        text->setPos(record->getXValue(), record->getYValue());
        text->setZValue(record->getZValue());
        text->initShowText();
        if (auto* shadow = qobject_cast<QGraphicsDropShadowEffect*>(text->graphicsEffect()))
            shadow->setColor(DROP_SHADOW_COLOR);
        m_middleScene.addItem(text);
        logBoundingRect(*text, record->getTextObjectID());
    }
    limitTextsToRaster(m_middleScene);
}

QImage ThumbnailRender::renderMiddleSizeCanvasScene()
{
    return renderScene(m_middleScene, THUMBNAIL_MID_SIZE);
}

void ThumbnailRender::saveMiddleSizeThumnail(const Archive& archive, const QImage& image)
{
    Q_EMIT saveHalfThumbnailsOK(
        QString::fromStdString(archive.getPath()),
        image.scaled(THUMBNAIL_SMALL_SIZE, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
}

void ThumbnailRender::clearMiddleSizeCanvasScene()
{
    m_middleScene.clear();
    m_middleBackground = nullptr;
    clearMiddleSizeCanvasSceneResource();
}

void ThumbnailRender::makeBigSizeThumbnail(const Archive& archive)
{
    auto job = std::make_unique<BigPicture>();
    job->archive = std::make_unique<Archive>(archive);
    job->hadTitle = QFile::exists(QString::fromStdString(archive.getPath()));
    keepBackground(archive, [this] { announceDecoded(); });
    job->background = m_background;
    m_bigPictures.push_back(std::move(job));
    announceDecoded();
}

void ThumbnailRender::expectPictures(const Archive& archive)
{
    keepBackground(archive, [this] { announceDecoded(); });
}

// Makes m_background that of the title. decoded is called in another thread if it is decoded there.
void ThumbnailRender::keepBackground(const Archive& archive, std::function<void()> decoded)
{
    m_idleTime.start();
    const QString path = archive.getFullPathOfBgResourceBig();
    if (path.isEmpty())
        m_background.reset();
    else if (!m_background || !m_background->isThatOf(path))
        m_background = std::make_shared<DecodedBackground>(path, std::move(decoded));
}

void ThumbnailRender::giveBackMemory()
{
    if (m_background && m_background->isDone()) // deleting another one would wait for its thread
        m_background.reset();
    RasterPool::clear();
}

// Called in any thread.
void ThumbnailRender::announceDecoded()
{
    QMetaObject::invokeMethod(this, &ThumbnailRender::drawDecodedBigPictures, Qt::QueuedConnection);
}

// Draws the next picture whose background is decoded. Decoding 1920x1080 takes at least as long as drawing
// the texts, so it is done in another thread.
void ThumbnailRender::drawDecodedBigPictures()
{
    if (m_background && m_background->isDone())
        m_background->takeResult();
    if (!m_bigPictures.empty() && m_bigPictures.front()->isDecoded())
        drawNextBigPicture();
    // Draws only one picture per event.
    if (!m_bigPictures.empty() && m_bigPictures.front()->isDecoded())
        announceDecoded();
}

void ThumbnailRender::drawNextBigPicture()
{
    const std::unique_ptr<BigPicture> job = std::move(m_bigPictures.front());
    m_bigPictures.pop_front();
    const QFileInfo title(QString::fromStdString(job->archive->getPath()));
    if (job->hadTitle && !title.exists() && title.dir().exists())
        return; // the title was deleted meanwhile
    const QPixmap background = job->background ? job->background->picture()->pixmap() : QPixmap();
    saveBigSizeThumnail(*job->archive, drawPictures(*job->archive, background));
}

QList<QImage> ThumbnailRender::drawPictures(const Archive& archive)
{
    keepBackground(archive, [] {});
    return drawPictures(archive, m_background ? m_background->picture()->pixmap() : QPixmap());
}

QList<QImage> ThumbnailRender::drawPictures(const Archive& archive, const QPixmap& background)
{
    m_bigScene.show(archive, background);
    const QList<QImage> images = renderBigAndMiddleSizeCanvasScene();
    clearBigSizeCanvasScene();
    return images;
}

QList<QImage> ThumbnailRender::renderBigAndMiddleSizeCanvasScene()
{
    const QImage big = renderScene(m_bigScene.scene(), THUMBNAIL_BIG_SIZE);
    QImage middle = RasterPool::take(THUMBNAIL_MIDDLE_SIZE);
    if (!big.isNull() && !middle.isNull())
        HalfPicture::reduce(big, middle);
    return {big, middle};
}

void ThumbnailRender::saveBigSizeThumnail(const Archive& archive, const QList<QImage>& images)
{
    m_pictureThread.addArchive(&archive, images);
}

void ThumbnailRender::clearBigSizeCanvasScene()
{
    m_bigScene.clear();
    clearBigSizeCanvasSceneResource();
}

void ThumbnailRender::clearBigSizeCanvasSceneResource()
{
}

void ThumbnailRender::clearMiddleSizeCanvasSceneResource()
{
}

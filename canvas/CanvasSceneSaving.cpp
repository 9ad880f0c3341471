// How the canvas saves the title that it shows, and asks for its pictures.
#include "canvas/CanvasScene.h"

#include "canvas/GraphicsPixmap.h"
#include "canvas/GraphicsText.h"
#include "canvas/IThumbnailRender.h"
#include "canvas/SaveOutage.h"
#include "canvas/TextObjectList.h"
#include "document/Archive.h"
#include "document/ArchiveManager.h"
#include "document/CanvasController.h"
#include "document/PngWriter.h"
#include "document/TText.h"
#include "support/RefusedWrites.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFileInfo>
#include <QPainter>
#include <QPixmap>
#include <QThread>
#include <algorithm>
#include <iterator>
#include <limits>
#include <utility>
#include <vector>

namespace
{

constexpr int PICTURE_POLL = 5;          // ms
constexpr int LONGEST_IDLE_TIME = 30000; // ms in which not one title gets its pictures

} // namespace

void CanvasScene::saveArchive()
{
    // An emptied title is saved; one that was empty all the time has nothing to be saved.
    if (!m_archive || (enableItems().isEmpty() && m_archive->text().empty()))
        return;
    const bool isSaved = saveArchiveXML(QString::fromStdString(m_archive->getPath()));
    if (isSaved && !RefusedWrites::isEmpty()) // the disk takes again what it refused before
        SaveOutage::instance()->retry();
    if (m_thumbnailRender)
        m_thumbnailRender->makeThumbnail(m_archive.get(), false);
    m_contentsChanged = false;
}

bool CanvasScene::saveArchiveXML(const QString& path)
{
    // Oldest first, so that the order in the file does not change with the stacking of the moment.
    std::vector<TText*> records;
    const QList<GraphicsText*> enabled = m_texts->enabledTexts();
    for (GraphicsText* item : std::as_const(*m_texts).listed()) {
        if (!enabled.contains(item) || item->isBlank())
            continue;
        TText* record = item->getTextList();
        record->setXValue(float(item->scenePos().x()));
        record->setYValue(float(item->scenePos().y()));
        record->setZValue(item->getItemTText()->getZValue());
        records.push_back(record);
    }
    if (m_currentPixmapItem) {
        m_archive->setBgPointX(float(m_currentPixmapItem->x()));
        m_archive->setBgPointY(float(m_currentPixmapItem->y()));
        m_archive->setBgPointZ(float(m_currentPixmapItem->zValue()));
    }
    m_archive->releaseVectorText();
    m_archive->setText(records);
    return m_controller->saveArchiveChange(path, m_archive.get());
}

void CanvasScene::slotSaveArchive(GraphicsText* item)
{
    saveArchive();
    m_thumbnailNeeded = true;
    if (item)
        item->update();
}

void CanvasScene::slotMakeSceneThumnail()
{
    const QFileInfo title(m_archive ? QString::fromStdString(m_archive->getPath()) : QString());
    // A title that is not there was deleted, unless its whole folder is away: that may have another name.
    const bool needed = m_archive && m_thumbnailNeeded && (title.exists() || !title.dir().exists());
    if (needed && m_thumbnailRender)
        m_thumbnailRender->makeThumbnail(m_archive.get(), true);
    m_thumbnailNeeded = false;
}

void CanvasScene::createThumnailPicture()
{
    if (!m_archive)
        return;
    if (m_thumbnailRender)
        m_thumbnailRender->makeThumbnail(m_archive.get(), false);
    m_thumbnailNeeded = true;
}

bool CanvasScene::isEditFinish() const
{
    return !m_thumbnailRender || m_thumbnailRender->makePictureThreadIsFinished();
}

bool CanvasScene::waitForPictures() const
{
    QElapsedTimer idle;
    idle.start();
    int left = std::numeric_limits<int>::max();
    while (!isEditFinish() && !idle.hasExpired(LONGEST_IDLE_TIME)) {
        if (const int now = m_thumbnailRender->unfinishedTitles(); now < left) {
            left = now;
            idle.restart();
        }
        QThread::msleep(PICTURE_POLL);
    }
    return isEditFinish();
}

// A picture may be missing after a disk was full, or when a copy was cut off; one that is older than the
// title shows what it said before the process was killed.
bool CanvasScene::lacksPictures() const
{
    const QFileInfo title(QString::fromStdString(m_archive->getPath()));
    const std::string names[] = {m_archive->getThumbnailBig(), m_archive->getThumbnailMiddle(),
                                 m_archive->getThumbnailSmall(), m_archive->getThumbnailBlack()};
    return title.exists() && std::any_of(std::begin(names), std::end(names), [&](const std::string& name) {
               const QFileInfo picture(title.path() + QLatin1Char('/') + QString::fromStdString(name));
               return ArchiveManager::isPictureName(name) &&
                      (!picture.exists() || picture.lastModified() < title.lastModified());
           });
}

void CanvasScene::generateThumbnail(QSize size, const QString& path)
{
    QPixmap picture(size);
    if (picture.isNull())
        return;
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    painter.setRenderHint(QPainter::Antialiasing);
    render(&painter);
    painter.end();
    PngWriter::save(picture.toImage(), path);
}

void CanvasScene::folderRenamed(const QString& before, const QString& after)
{
    const QString from = QDir::cleanPath(before);
    const QString to = QDir::cleanPath(after);
    if (QFileInfo::exists(to) || !QFileInfo::exists(from)) { // else the notice is wrong, or early
        RefusedWrites::folderRenamed(from.toStdString(), to.toStdString());
        if (m_thumbnailRender)
            m_thumbnailRender->folderRenamed(from, to);
        SaveOutage::instance()->retry();
    }
    const QFileInfo title(m_archive ? QString::fromStdString(m_archive->getPath()) : QString());
    if (!m_archive || QDir::cleanPath(title.path()) != QDir::cleanPath(before))
        return;
    m_archive->setPath((after + QLatin1Char('/') + title.fileName()).toStdString());
    if (!itemIsEditorInteraction())
        return;
    leaveEditing();
    slotDeleteEmptyItems();
    disableTextPropertyArea();
}

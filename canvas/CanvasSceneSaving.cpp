// How the canvas saves the title that it shows, and asks for its pictures.
#include "canvas/CanvasScene.h"

#include "canvas/GraphicsPixmap.h"
#include "canvas/GraphicsText.h"
#include "canvas/IThumbnailRender.h"
#include "canvas/TextObjectList.h"
#include "document/Archive.h"
#include "document/CanvasController.h"
#include "document/PngWriter.h"
#include "document/TText.h"

#include <QDir>
#include <QFileInfo>
#include <QPainter>
#include <QPixmap>
#include <utility>
#include <vector>

void CanvasScene::saveArchive()
{
    // An emptied title is saved; one that was empty all the time has nothing to be saved.
    if (!m_archive || (enableItems().isEmpty() && m_archive->text().empty()))
        return;
    saveArchiveXML(QString::fromStdString(m_archive->getPath()));
    if (m_thumbnailRender)
        m_thumbnailRender->makeThumbnail(m_archive.get(), false);
    m_contentsChanged = false;
}

void CanvasScene::saveArchiveXML(const QString& path)
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
    m_controller->saveArchiveChange(path, m_archive.get());
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
    const bool needed =
        m_archive && m_thumbnailNeeded && QFileInfo::exists(QString::fromStdString(m_archive->getPath()));
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

#include "canvas/ShownTitle.h"

#include "canvas/GraphicsPixmap.h"
#include "canvas/GraphicsText.h"
#include "canvas/IThumbnailRender.h"
#include "canvas/SaveOutage.h"
#include "canvas/TextObjectList.h"
#include "document/Archive.h"
#include "document/ArchiveManager.h"
#include "document/CanvasController.h"
#include "document/TText.h"
#include "support/RefusedWrites.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFileInfo>
#include <algorithm>
#include <iterator>
#include <limits>
#include <utility>
#include <vector>

namespace
{

constexpr int PICTURE_POLL = 5;          // ms
constexpr int LONGEST_IDLE_TIME = 30000; // ms without the pictures of any title being finished

} // namespace

ShownTitle::ShownTitle(std::unique_ptr<IThumbnailRender> render)
    : m_controller(std::make_unique<CanvasController>()), m_render(std::move(render))
{
    SaveOutage::instance(); // titles may be saved from now on
}

ShownTitle::~ShownTitle() = default;

void ShownTitle::show(const Archive& archive)
{
    if (&archive != m_archive.get())
        m_archive = std::make_unique<Archive>(archive);
}

void ShownTitle::forget()
{
    m_archive.reset();
}

QString ShownTitle::path() const
{
    return m_archive ? QString::fromStdString(m_archive->getPath()) : QString();
}

bool ShownTitle::save(const TextObjectList& texts, const GraphicsPixmap* background)
{
    // A title whose texts were deleted is saved; one that has been empty since it was opened is not.
    if (!m_archive || (texts.enableItems().isEmpty() && m_archive->text().empty()))
        return false;
    const bool isSaved = writeFile(texts, background);
    if (isSaved && !RefusedWrites::isEmpty()) // the disk can be written again
        SaveOutage::instance()->retry();
    if (m_render)
        m_render->makeThumbnail(m_archive.get(), false);
    return true;
}

bool ShownTitle::writeFile(const TextObjectList& texts, const GraphicsPixmap* background)
{
    // Oldest first, so that the order in the file does not depend on the stacking order.
    std::vector<TText*> records;
    const QList<GraphicsText*> enabled = texts.enabledTexts();
    for (GraphicsText* item : texts.listed()) {
        if (!enabled.contains(item) || item->isBlank())
            continue;
        TText* record = item->getTextList();
        record->setXValue(float(item->scenePos().x()));
        record->setYValue(float(item->scenePos().y()));
        record->setZValue(item->getItemTText()->getZValue());
        records.push_back(record);
    }
    if (background) {
        m_archive->setBgPointX(float(background->x()));
        m_archive->setBgPointY(float(background->y()));
        m_archive->setBgPointZ(float(background->zValue()));
    }
    m_archive->releaseVectorText();
    m_archive->setText(records);
    return m_controller->saveArchiveChange(path(), m_archive.get());
}

void ShownTitle::setPicturesNeeded()
{
    if (!m_picturesNeeded && m_archive && m_render)
        m_render->expectPictures(*m_archive);
    m_picturesNeeded = true;
}

void ShownTitle::makeNeededPictures()
{
    const QFileInfo title(path());
    // A title that does not exist was deleted, unless its whole folder is missing: the folder may have been
    // renamed.
    const bool needed = m_archive && m_picturesNeeded && (title.exists() || !title.dir().exists());
    if (needed && m_render)
        m_render->makeThumbnail(m_archive.get(), true);
    m_picturesNeeded = false;
}

void ShownTitle::makeLackingPictures()
{
    if (m_archive && m_render && lacksPictures())
        m_render->makeThumbnail(m_archive.get(), true);
}

void ShownTitle::makeSmallPicture()
{
    if (!m_archive)
        return;
    if (m_render)
        m_render->makeThumbnail(m_archive.get(), false);
    setPicturesNeeded();
}

bool ShownTitle::isEditFinish() const
{
    return !m_render || m_render->makePictureThreadIsFinished();
}

bool ShownTitle::waitForPictures() const
{
    QElapsedTimer idle;
    idle.start();
    int left = std::numeric_limits<int>::max();
    while (!isEditFinish() && !idle.hasExpired(LONGEST_IDLE_TIME)) {
        if (const int now = m_render->unfinishedTitles(); now < left) {
            left = now;
            idle.restart();
        }
        m_render->waitForProgress(PICTURE_POLL);
    }
    return isEditFinish();
}

// Returns whether a picture is missing or older than the title. A full disk or an interrupted copy leaves a
// picture out, and a killed process leaves one from before the last change.
bool ShownTitle::lacksPictures() const
{
    const QFileInfo title(path());
    const std::string names[] = {m_archive->getThumbnailBig(), m_archive->getThumbnailMiddle(),
                                 m_archive->getThumbnailSmall(), m_archive->getThumbnailBlack()};
    return title.exists() && std::any_of(std::begin(names), std::end(names), [&](const std::string& name) {
               const QFileInfo picture(title.path() + QLatin1Char('/') + QString::fromStdString(name));
               return ArchiveManager::isPictureName(name) &&
                      (!picture.exists() || picture.lastModified() < title.lastModified());
           });
}

bool ShownTitle::folderRenamed(const QString& before, const QString& after)
{
    const QString from = QDir::cleanPath(before);
    const QString to = QDir::cleanPath(after);
    if (QFileInfo::exists(to) || !QFileInfo::exists(from)) { // otherwise the notice is wrong, or early
        RefusedWrites::folderRenamed(from.toStdString(), to.toStdString());
        if (m_render)
            m_render->folderRenamed(from, to);
        SaveOutage::instance()->retry();
    }
    const QFileInfo title(path());
    if (!m_archive || QDir::cleanPath(title.path()) != from)
        return false;
    m_archive->setPath((after + QLatin1Char('/') + title.fileName()).toStdString());
    return true;
}

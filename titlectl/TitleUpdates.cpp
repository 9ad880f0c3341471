#include "titlectl/TitleUpdates.h"

#include "document/Archive.h"
#include "document/PictureReader.h"
#include "document/PngWriter.h"
#include "document/TitleParser.h"
#include "library/TitleFileOperations.h"
#include "support/AtomicFile.h"
#include "support/FileSyncQueue.h"
#include "titlectl/RenderBatch.h"
#include "titlectl/TitleStage.h"

#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QSize>
#include <cerrno>
#include <chrono>
#include <cstring>
#include <unordered_set>
#include <utility>

namespace
{

constexpr QSize CANVAS_SIZE(1280, 720);
constexpr QSize AIR_SIZE(1920, 1080);
constexpr std::chrono::seconds SYNC_LIMIT(60);
const QString PNG = QStringLiteral(".png");

QString lastError()
{
    return QString::fromLocal8Bit(std::strerror(errno));
}

// Returns the picture scaled to fill the size, without what reaches beyond it.
QImage filling(const QImage& picture, QSize size)
{
    const QImage scaled = picture.scaled(size, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation);
    const QPoint corner((scaled.width() - size.width()) / 2, (scaled.height() - size.height()) / 2);
    return scaled.copy(QRect(corner, size));
}

// Returns the ending of a file name with its dot.
QString endingOf(const QString& path)
{
    const QString suffix = QFileInfo(path).suffix();
    return suffix.isEmpty() ? QString() : QLatin1Char('.') + suffix;
}

// Copies a background of the template. Returns what went wrong, or an empty string.
QString copyBackground(const QString& from, const QString& to)
{
    if (AtomicFile::copy(from.toStdString(), to.toStdString()))
        return {};
    return QStringLiteral("the background %1 cannot be copied: %2").arg(from, lastError());
}

} // namespace

TitleUpdates::TitleUpdates(const ListPlan& plan, const Archive& sample, const QString& folder)
    : m_plan(plan), m_sample(sample), m_folder(folder), m_errors(qsizetype(plan.rows().size()))
{
}

QStringList TitleUpdates::make(int processes, const std::function<void()>& oneDone)
{
    const TitleStage stage(m_folder);
    QList<int> batch;
    const auto makeBatchOfRows = [&] {
        makeBatch(stage, batch, processes, oneDone);
        batch.clear();
    };
    for (int row = 0; row < int(m_plan.rows().size()); ++row) {
        if (m_plan.rows()[std::size_t(row)].outcome == ListPlan::Outcome::Wrong)
            continue;
        if (!stage.isValid()) {
            m_errors[row] = stage.error();
            continue;
        }
        batch.append(row);
        if (batch.size() == BATCH)
            makeBatchOfRows();
    }
    makeBatchOfRows();
    nameNewTitles();
    return m_errors;
}

void TitleUpdates::makeBatch(const TitleStage& stage, const QList<int>& rows, int processes,
                             const std::function<void()>& oneDone)
{
    QList<RenderJob> jobs;
    QList<int> staged;
    for (const int row : rows) {
        m_errors[row] = stageTitle(stage, row);
        if (!m_errors[row].isEmpty()) {
            oneDone();
            continue;
        }
        const QString& stem = m_plan.rows()[std::size_t(row)].stem;
        jobs.append({stage.path() + QLatin1Char('/') + stem + TitleFileOperations::XML_EXTENSION, QString()});
        staged.append(row);
    }
    const QStringList errors = RenderBatch::run(jobs, processes, oneDone);
    // Until then older versions of the files are kept beside them.
    FileSyncQueue::flush(SYNC_LIMIT);
    for (qsizetype i = 0; i < staged.size(); ++i) {
        const QString& stem = m_plan.rows()[std::size_t(staged.at(i))].stem;
        QString& error = m_errors[staged.at(i)];
        error = errors.at(i);
        if (error.isEmpty())
            error = stage.place(stem);
        else
            stage.drop(stem);
    }
}

// Writes the title file and its background on the stage.
QString TitleUpdates::stageTitle(const TitleStage& stage, int row) const
{
    const std::unique_ptr<Archive> title = m_plan.title(row);
    const QString& stem = m_plan.rows()[std::size_t(row)].stem;
    title->setPath(
        (stage.path() + QLatin1Char('/') + stem + TitleFileOperations::XML_EXTENSION).toStdString());
    QString error = stageBackground(*title, row);
    if (error.isEmpty() && TitleParser().writeOneTitle(title.get()) != 1)
        error = lastError();
    if (!error.isEmpty())
        stage.drop(stem);
    return error;
}

QString TitleUpdates::stageBackground(Archive& title, int row) const
{
    const QString stem = QString::fromStdString(title.getName());
    const QString picture = m_plan.picture(row);
    if (!picture.isEmpty()) {
        const QImage image = PictureReader::read(picture);
        if (image.isNull())
            return QStringLiteral("the picture %1 cannot be read").arg(picture);
        title.setBgResource((stem + TitleFileOperations::BG_SOURCE + PNG).toStdString());
        title.setBgResourceBig((stem + TitleFileOperations::BG_SOURCE_BIG + PNG).toStdString());
        if (!PngWriter::save(filling(image, CANVAS_SIZE), title.getFullPathOfBgResource()) ||
            !PngWriter::save(filling(image, AIR_SIZE), title.getFullPathOfBgResourceBig()))
            return lastError();
        return {};
    }
    if (m_sample.isPreset())
        return {}; // the record names a file that all titles of the preset share
    QString error;
    if (const QString from = m_sample.getFullPathOfBgResource(); !from.isEmpty()) {
        title.setBgResource((stem + TitleFileOperations::BG_SOURCE + endingOf(from)).toStdString());
        error = copyBackground(from, title.getFullPathOfBgResource());
    }
    if (const QString from = m_sample.getFullPathOfBgResourceBig(); !from.isEmpty() && error.isEmpty()) {
        title.setBgResourceBig((stem + TitleFileOperations::BG_SOURCE_BIG + endingOf(from)).toStdString());
        error = copyBackground(from, title.getFullPathOfBgResourceBig());
    }
    return error;
}

// Returns the file name of the title of a row that was made; empty for any other.
std::string TitleUpdates::fileOf(qsizetype row) const
{
    const ListPlan::Row& planned = m_plan.rows()[std::size_t(row)];
    if (planned.outcome == ListPlan::Outcome::Wrong || !m_errors.at(row).isEmpty())
        return {};
    return (planned.stem + TitleFileOperations::XML_EXTENSION).toStdString();
}

// Returns the titles that the order names. Without a whole order file it is made of all titles that are
// there; those of the list are left out then, since they come in the order of their rows.
std::vector<ArchiveOrder> TitleUpdates::orderBefore(bool isWhole) const
{
    std::vector<ArchiveOrder> order = FolderOrder::rowsToShow(m_folder.toStdString());
    if (isWhole)
        return order;
    std::unordered_set<std::string> made;
    for (qsizetype row = 0; row < m_errors.size(); ++row)
        made.insert(fileOf(row));
    std::erase_if(order, [&](const ArchiveOrder& title) { return made.contains(title.getArchivePath()); });
    for (std::size_t i = 0; i < order.size(); ++i)
        order[i].setArchiveIndex(int(i));
    return order;
}

// Appends the titles that the order does not name yet, in the order of their rows.
void TitleUpdates::nameNewTitles()
{
    const std::string folder = m_folder.toStdString();
    const bool isWhole = FolderOrder::stateOf(folder) == FolderOrder::State::Whole;
    std::vector<ArchiveOrder> order = orderBefore(isWhole);
    std::unordered_set<std::string> known;
    for (const ArchiveOrder& title : order)
        known.insert(title.getArchivePath());
    QList<qsizetype> added;
    for (qsizetype row = 0; row < m_errors.size(); ++row) {
        const std::string file = fileOf(row);
        if (file.empty() || known.contains(file))
            continue;
        ArchiveOrder title;
        title.setArchiveIndex(int(order.size()));
        title.setArchivePath(file);
        order.push_back(title);
        added.append(row);
    }
    if ((added.isEmpty() && isWhole) || FolderOrder::write(folder, order))
        return;
    const QString error = QStringLiteral("the order of the folder cannot be written: %1").arg(lastError());
    for (const qsizetype row : std::as_const(added))
        m_errors[row] = error;
}

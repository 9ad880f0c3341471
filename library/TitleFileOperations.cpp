#include "library/TitleFileOperations.h"

#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "library/TitlerUtility.h"
#include "support/AtomicFile.h"
#include "support/ConfinedPath.h"
#include "support/LogManager.h"
#include "support/SystemInfo.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <future>

const QString TitleFileOperations::TIME_FORMATE = QStringLiteral("yyyyMMddhhmmsszzz");
const QString TitleFileOperations::THUMBNAIL_BIG = QStringLiteral("_1920.png");
const QString TitleFileOperations::THUMBNAIL_MIDDLE = QStringLiteral("_960.png");
const QString TitleFileOperations::THUMBNAIL_SMALL = QStringLiteral("_240.png");
const QString TitleFileOperations::THUMBNAIL_BLACK = QStringLiteral("_240S.png");
const QString TitleFileOperations::THUMBNAIL_SOURCE = QStringLiteral("_240");
const QString TitleFileOperations::BG_SOURCE = QStringLiteral("_source_1280");
const QString TitleFileOperations::BG_SOURCE_BIG = QStringLiteral("_source_1920");
const QString TitleFileOperations::XML_EXTENSION = QStringLiteral(".xml");
const QString TitleFileOperations::TEMPLATE_STEM = QStringLiteral("Titler");

namespace
{

// No picture of a title has nearly this size; larger files were not made by this program.
constexpr std::size_t PICTURE_LIMIT = 64 * 1024 * 1024;

QByteArray readPicture(const QString& path)
{
    std::string bytes;
    if (path.isEmpty() || !AtomicFile::read(path.toStdString(), PICTURE_LIMIT, bytes))
        return {};
    return QByteArray::fromStdString(bytes);
}

// Returns an empty path for a name that leads outside the folders of titles and templates.
QString pictureOf(const Archive& archive, const std::string& name)
{
    if (name.empty())
        return {};
    const std::string folder = QFileInfo(QString::fromStdString(archive.getPath())).path().toStdString();
    return QString::fromStdString(ConfinedPath::namedByTitle(
        folder, TitlerUtility::getThumbnailPathFromTitlePath(archive.getPath(), name)));
}

void writePicture(const Archive& archive, const std::string& name, const QByteArray& bytes)
{
    if (!name.empty() && !bytes.isEmpty())
        AtomicFile::write(TitlerUtility::getThumbnailPathFromTitlePath(archive.getPath(), name),
                          {bytes.constData(), static_cast<std::size_t>(bytes.size())},
                          AtomicFile::Durability::SyncLater, AtomicFile::Links::Replace);
}

void writePictures(const Archive& archive, const TitlePictures& pictures)
{
    writePicture(archive, archive.getThumbnailBig(), pictures.big);
    writePicture(archive, archive.getThumbnailSmall(), pictures.small);
    writePicture(archive, archive.getThumbnailMiddle(), pictures.middle);
    writePicture(archive, archive.getThumbnailBlack(), pictures.black);
}

// Returns the part from the last "." on; empty when there is none.
QString extensionOf(const std::string& fileName)
{
    const QString name = QString::fromStdString(fileName);
    const qsizetype dot = name.lastIndexOf(QLatin1Char('.'));
    return dot < 0 || dot < name.lastIndexOf(QLatin1Char('/')) ? QString() : name.mid(dot);
}

// Returns whether the background is copied under names of its own. Without these it would be copied over
// files that may belong to another title.
bool hasOwnBackground(const Archive& archive)
{
    return !archive.isPreset() && !extensionOf(archive.getThumbnailSmall()).isEmpty();
}

// Removes the files of a title that could not be created completely: the pictures whose names begin with its
// stem.
void removeFiles(const Archive& archive, const std::string& stem)
{
    for (const std::string& name :
         {archive.getThumbnailBig(), archive.getThumbnailMiddle(), archive.getThumbnailBlack(),
          archive.getThumbnailSmall(), archive.getBgResource(), archive.getBgResourceBig()})
        if (name.starts_with(stem))
            QFile::remove(pictureOf(archive, name));
}

} // namespace

TitleFileOperations::TitleFileOperations(ArchiveController& controller) : m_controller(controller)
{
}

QString TitleFileOperations::freeStem(const QString& folder, const QDateTime& now)
{
    QDateTime moment = now;
    QString stem = moment.toString(TIME_FORMATE);
    while (QFile::exists(folder + QLatin1Char('/') + stem + XML_EXTENSION)) {
        moment = moment.addMSecs(1);
        stem = moment.toString(TIME_FORMATE);
    }
    return stem;
}

void TitleFileOperations::renameRecord(Archive& archive, const QString& folder) const
{
    const QString stem = freeStem(folder);
    const QString extension = extensionOf(archive.getThumbnailSmall());

    archive.setName(stem.toStdString());
    archive.setPath((folder + QLatin1Char('/') + stem + XML_EXTENSION).toStdString());
    archive.setThumbnailBig((stem + THUMBNAIL_BIG).toStdString());
    archive.setThumbnailSmall((stem + THUMBNAIL_SMALL).toStdString());
    archive.setThumbnailMiddle((stem + THUMBNAIL_MIDDLE).toStdString());
    archive.setThumbnailBlack((stem + THUMBNAIL_BLACK).toStdString());
    if (archive.isPreset())
        return;
    if (extension.isEmpty()) {
        LOG_EVENT(L"ArchiveList", __LINE__, L"small thumbnail without an extension", 4);
        return;
    }
    archive.setThumbnailSmall((stem + THUMBNAIL_SOURCE + extension).toStdString());
    if (!archive.getBgResource().empty())
        archive.setBgResource((stem + BG_SOURCE + extension).toStdString());
    if (!archive.getBgResourceBig().empty())
        archive.setBgResourceBig((stem + BG_SOURCE_BIG + extension).toStdString());
}

std::unique_ptr<Archive> TitleFileOperations::createFromTemplate(const QString& folder,
                                                                 const Archive& source) const
{
    if (folder.isEmpty())
        return nullptr;
    auto archive = std::make_unique<Archive>(source);
    renameRecord(*archive, folder);
    Archive from(source);
    m_controller.copyArchiveThumbnail(&from, archive.get());
    const bool isCopied = !hasOwnBackground(source) || m_controller.copyArchiveBg(&from, archive.get()) == 1;
    if (!isCopied || !m_controller.saveNewArchive(folder, archive.get())) {
        removeFiles(*archive, archive->getName());
        return nullptr;
    }
    return archive;
}

TitlePictures TitleFileOperations::loadPictures(const Archive& archive)
{
    TitlePictures pictures;
    pictures.big = readPicture(pictureOf(archive, archive.getThumbnailBig()));
    pictures.middle = readPicture(pictureOf(archive, archive.getThumbnailMiddle()));
    pictures.black = readPicture(pictureOf(archive, archive.getThumbnailBlack()));
    pictures.small = readPicture(archive.getFullPathOfThumbnailSmall());
    return pictures;
}

std::unique_ptr<Archive> TitleFileOperations::createFromCopy(const QString& folder, const Archive& copy,
                                                             const TitlePictures& pictures) const
{
    if (folder.isEmpty())
        return nullptr;
    auto archive = std::make_unique<Archive>(copy);
    renameRecord(*archive, folder);
    // The files of a photograph have several megabytes each, so half of them are written in another thread.
    const std::future<void> written =
        std::async(std::launch::async, [&] { writePictures(*archive, pictures); });
    bool isCopied = true;
    if (hasOwnBackground(copy)) {
        Archive from(copy);
        isCopied = m_controller.copyArchiveBg(&from, archive.get()) == 1;
    }
    written.wait();
    if (!isCopied || !m_controller.saveNewArchive(folder, archive.get())) {
        removeFiles(*archive, archive->getName());
        return nullptr;
    }
    return archive;
}

std::unique_ptr<Archive> TitleFileOperations::createUserTemplate(const QString& root, const QString& name,
                                                                 const Archive& source) const
{
    if (root.isEmpty() || name.isEmpty())
        return nullptr;
    const QString folder = root + QLatin1Char('/') + name;
    if (!SystemInfo::createFolders(folder.toStdWString())) {
        LOG_EVENT(L"ArchiveList", __LINE__, L"ERROR create dir.", 4);
        // The folder of a deleted template is used again. If it contains a template, that is kept, even if
        // the order file does not list it.
        if (!QFileInfo(folder).isDir() ||
            QFileInfo::exists(folder + QLatin1Char('/') + TEMPLATE_STEM + XML_EXTENSION))
            return nullptr;
    }
    bool isCopied = true;

    auto target = std::make_unique<Archive>(source);
    target->setName((name + QLatin1Char('/') + TEMPLATE_STEM).toStdString());
    target->setPath((folder + QLatin1Char('/') + TEMPLATE_STEM + XML_EXTENSION).toStdString());
    const QString extension = extensionOf(source.getThumbnailSmall());
    if (extension.isEmpty()) {
        LOG_EVENT(L"ArchiveList", __LINE__, L"small thumbnail without an extension", 4);
    } else {
        target->setThumbnailSmall((TEMPLATE_STEM + THUMBNAIL_SOURCE + extension).toStdString());
        writePicture(*target, target->getThumbnailSmall(), readPicture(source.getFullPathOfThumbnailSmall()));
        // The template gets a background of its own, even if the source has that of a preset.
        if (!source.getBgResource().empty())
            target->setBgResource((TEMPLATE_STEM + BG_SOURCE + extension).toStdString());
        if (!source.getBgResourceBig().empty())
            target->setBgResourceBig((TEMPLATE_STEM + BG_SOURCE_BIG + extension).toStdString());
        Archive from(source);
        isCopied = m_controller.copyArchiveBg(&from, target.get()) == 1;
    }
    if (!isCopied || !m_controller.saveNewArchive(root, target.get())) {
        removeFiles(*target, TEMPLATE_STEM.toStdString());
        QDir().rmdir(folder); // removes it only if it is empty
        return nullptr;
    }
    return target;
}

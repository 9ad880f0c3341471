#include "appliance/TitlerProvision.h"

#include "appliance/PresetTemplates.h"
#include "appliance/SampleBackgrounds.h"
#include "document/ArchiveOrder.h"
#include "document/TitleParser.h"
#include "library/ThumbnailRender.h"
#include "support/k2sys/k2sys.h"

#include <QDeadlineTimer>
#include <QDir>
#include <QFileInfo>
#include <QSaveFile>
#include <QThread>
#include <QXmlStreamWriter>
#include <array>
#include <utility>

namespace
{

constexpr int PATH_BUFFER = 1024;
constexpr int PICTURES_TIMEOUT_MS = 60000;
constexpr auto TITLES = "resources/Titles";
constexpr auto TEMPLATES = "resources/Templates";

// All elements that programs of the appliance look up in the path file, with their folders.
constexpr std::array<std::pair<const char*, const char*>, 20> PATH_NODES{{
    {"Data", "data"},
    {"Resource", "resources"},
    {"Template", TEMPLATES},
    {"TitleResource", TITLES},
    {"TitleImage", "resources/TitleImages"},
    {"TitlerTemplate", "resources/TitlerTemplates"},
    {"Titler", "resources/Titler"},
    {"Title", "resources/TitleFiles"},
    {"Logo", "resources/Logos"},
    {"Movie", "resources/Movies"},
    {"MXF", "resources/MXF"},
    {"VOD", "resources/VOD"},
    {"Font", "resources/Fonts"},
    {"Audio", "resources/Audio"},
    {"Project", "projects/current"},
    {"Projects", "projects"},
    {"SystemSetting", "settings"},
    {"CurrentStatus", "status"},
    {"StreamKey", "streamkeys"},
    {"tmp", "tmp"},
}};

// Returns the temporary folder in which a set is prepared before it is renamed to path.
QString asideOf(const QString& path)
{
    return path + QStringLiteral(".making");
}

} // namespace

TitlerProvision::TitlerProvision(QString basePath) : m_base(std::move(basePath))
{
}

QString TitlerProvision::basePathOfEnvironment()
{
    std::array<char, PATH_BUFFER> data{};
    std::array<char, PATH_BUFFER> root{};
    if (k2sys_getenv_ac_data(data.data(), data.size()) < 0)
        return {};
    QString path = QString::fromLocal8Bit(data.data());
    // As the titler does: if the root path is "/", the data path is used without its leading "/".
    if (k2sys_getenv_ac_root(root.data(), root.size()) == 1) {
        path.remove(0, 1);
        path.prepend(QString::fromLocal8Bit(root.data()));
    }
    return path.isEmpty() ? QString() : path + QStringLiteral("/defaultuser/");
}

bool TitlerProvision::writeMissing()
{
    return makeFolder(m_base) && writePathFile() && writeCheckers() && writeTemplates() && writeTitles();
}

bool TitlerProvision::writePathFile()
{
    const QString path = m_base + QStringLiteral("PathInfo.xml");
    if (QFileInfo::exists(path))
        return true;
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly))
        return fail(path + QStringLiteral(": ") + file.errorString());
    QXmlStreamWriter xml(&file);
    xml.setAutoFormatting(true);
    xml.writeStartDocument();
    xml.writeStartElement(QStringLiteral("PathInfo"));
    for (const auto& [node, folder] : PATH_NODES) {
        xml.writeEmptyElement(QString::fromLatin1(node));
        xml.writeAttribute(QStringLiteral("path"), QString::fromLatin1(folder));
    }
    xml.writeEndDocument();
    return file.commit() || fail(path + QStringLiteral(": ") + file.errorString());
}

bool TitlerProvision::writeCheckers()
{
    const QString folder = m_base + QLatin1String(TEMPLATES);
    if (!makeFolder(folder))
        return false;
    for (const QSize& size : {QSize(240, 135), QSize(135, 135)}) {
        const QString path =
            QStringLiteral("%1/checker_%2x%3.png").arg(folder).arg(size.width()).arg(size.height());
        if (!QFileInfo::exists(path) && !writePicture(SampleBackgrounds::checker(size), path))
            return false;
    }
    return true;
}

bool TitlerProvision::writeTemplates()
{
    const QString root = m_base + QLatin1String(TEMPLATES);
    ThumbnailRender render;
    return writeTemplateSet(render, root + QStringLiteral("/templates_en"), false) &&
           writeTemplateSet(render, root + QStringLiteral("/templates_chs"), true);
}

bool TitlerProvision::writeTemplateSet(ThumbnailRender& render, const QString& folder, bool chinese)
{
    if (QFileInfo::exists(folder))
        return true;
    // Titles name preset backgrounds by absolute paths, so these are written to their final folder at once.
    const QString backgrounds = m_base + QLatin1String(TEMPLATES) + QStringLiteral("/backgrounds");
    std::vector<SampleTitles::Sample> samples = PresetTemplates::samples(chinese);
    return makeFolder(backgrounds) && writeFolder(render, folder, samples, backgrounds);
}

bool TitlerProvision::writeTitles()
{
    // Samples are only written to a new data path: once the folder of titles exists, deleted samples must not
    // come back.
    const QString root = m_base + QLatin1String(TITLES);
    if (QFileInfo::exists(root))
        return true;
    const QString aside = asideOf(root);
    QDir(aside).removeRecursively();
    if (!makeFolder(aside))
        return false;
    ThumbnailRender render;
    for (SampleTitles::Folder& folder : SampleTitles::folders()) {
        const QString path = aside + QLatin1Char('/') + QString::fromStdString(folder.name);
        if (!writeFolder(render, path, folder.samples, QString()))
            return false;
    }
    return moveIntoPlace(aside, root);
}

bool TitlerProvision::writeFolder(ThumbnailRender& render, const QString& folder,
                                  std::vector<SampleTitles::Sample>& samples, const QString& backgroundFolder)
{
    const QString aside = asideOf(folder);
    QDir(aside).removeRecursively();
    if (!makeFolder(aside))
        return false;
    std::vector<ArchiveOrder> order;
    for (SampleTitles::Sample& sample : samples) {
        if (!writeTitle(render, aside, sample, backgroundFolder))
            return false;
        ArchiveOrder row;
        row.setArchiveIndex(static_cast<int>(order.size()));
        row.setArchivePath(sample.stem + ".xml");
        order.push_back(row);
    }
    TitleParser().writeFileOrderInFolder(aside.toStdString(), order);
    return moveIntoPlace(aside, folder);
}

bool TitlerProvision::writeTitle(ThumbnailRender& render, const QString& folder, SampleTitles::Sample& sample,
                                 const QString& backgroundFolder)
{
    Archive& archive = sample.archive;
    const std::string& stem = sample.stem;
    archive.setName(stem);
    archive.setPath(folder.toStdString() + "/" + stem + ".xml");
    archive.setThumbnailBig(stem + "_1920.png");
    archive.setThumbnailMiddle(stem + "_960.png");
    archive.setThumbnailSmall(stem + "_240.png");
    archive.setThumbnailBlack(stem + "_240S.png");
    if (sample.background) {
        // A title has its own background file; templates share theirs and name it by its absolute path.
        const bool own = backgroundFolder.isEmpty();
        const QString where = (own ? folder : backgroundFolder) + QLatin1Char('/');
        const QString name = QString::fromStdString(stem) + QStringLiteral("_source_%1.png");
        if (!writePicture(sample.background(QSize(1280, 720)), where + name.arg(1280)) ||
            !writePicture(sample.background(QSize(1920, 1080)), where + name.arg(1920)))
            return false;
        const QString prefix = own ? QString() : where;
        archive.setBgResource((prefix + name.arg(1280)).toStdString());
        archive.setBgResourceBig((prefix + name.arg(1920)).toStdString());
    }
    if (TitleParser().writeOneTitle(&archive) != 1 ||
        !QFileInfo::exists(QString::fromStdString(archive.getPath())))
        return fail(QStringLiteral("cannot write ") + QString::fromStdString(archive.getPath()));
    render.makeThumbnail(&archive, true);
    const QDeadlineTimer deadline(PICTURES_TIMEOUT_MS);
    while (!render.makePictureThreadIsFinished()) {
        if (deadline.hasExpired()) {
            return fail(QStringLiteral("the pictures take too long: ") +
                        QString::fromStdString(archive.getPath()));
        }
        QThread::msleep(2);
    }
    for (const std::string& picture : {archive.getThumbnailBig(), archive.getThumbnailMiddle(),
                                       archive.getThumbnailSmall(), archive.getThumbnailBlack()}) {
        const QString path = folder + QLatin1Char('/') + QString::fromStdString(picture);
        if (!QFileInfo::exists(path))
            return fail(QStringLiteral("cannot write ") + path);
    }
    return true;
}

bool TitlerProvision::writePicture(const QImage& picture, const QString& path)
{
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly) || !picture.save(&file, "PNG") || !file.commit())
        return fail(path + QStringLiteral(": ") + file.errorString());
    return true;
}

bool TitlerProvision::makeFolder(const QString& path)
{
    return QDir().mkpath(path) || fail(QStringLiteral("cannot make the folder ") + path);
}

bool TitlerProvision::moveIntoPlace(const QString& from, const QString& to)
{
    return QDir().rename(from, to) || fail(QStringLiteral("cannot move %1 to %2").arg(from, to));
}

bool TitlerProvision::fail(const QString& what)
{
    m_error = what;
    return false;
}

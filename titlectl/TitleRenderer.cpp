#include "titlectl/TitleRenderer.h"

#include "document/Archive.h"
#include "document/TitleParser.h"
#include "support/RefusedWrites.h"

#include <QFileInfo>
#include <cstring>

namespace
{

// Returns why pictures were not written, and drops them: the program ends before the disk could take them.
QString takeRefusal()
{
    QString reason;
    for (const RefusedWrites::File& file : RefusedWrites::files()) {
        if (reason.isEmpty())
            reason = QStringLiteral("%1: %2").arg(QString::fromStdString(file.path),
                                                  QString::fromLocal8Bit(std::strerror(file.error)));
        RefusedWrites::forget(file.path);
    }
    return reason;
}

} // namespace

QString TitleRenderer::render(const RenderJob& job)
{
    Archive archive;
    if (TitleParser().readOneTitle(job.title.toStdString(), &archive) != 1)
        return QStringLiteral("the title cannot be read");
    const QList<QImage> images = draw(archive);
    if (!job.folder.isEmpty()) // only now, since the record names its background beside the title
        archive.setPath((job.folder + QLatin1Char('/') + QFileInfo(job.title).fileName()).toStdString());
    return write(archive, images, job.pictures);
}

QString TitleRenderer::write(const Archive& archive, const QList<QImage>& images,
                             PictureFiles::Pictures pictures)
{
    if (PictureFiles::write(archive, images.at(0), images.at(1), pictures))
        return {};
    const QString refusal = takeRefusal();
    return refusal.isEmpty()
               ? QStringLiteral("a picture has no valid name, or the checker picture of the data path is "
                                "missing")
               : refusal;
}

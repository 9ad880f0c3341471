#include "titlectl/RenderJob.h"

#include <QJsonDocument>
#include <QJsonObject>

namespace
{

const QString TITLE = QStringLiteral("title");
const QString FOLDER = QStringLiteral("folder");
const QString PICTURES = QStringLiteral("pictures");

} // namespace

QByteArray RenderJob::toLine() const
{
    const QJsonObject object{{TITLE, title}, {FOLDER, folder}, {PICTURES, static_cast<int>(pictures)}};
    return QJsonDocument(object).toJson(QJsonDocument::Compact) + '\n';
}

std::optional<RenderJob> RenderJob::fromLine(const QByteArray& line)
{
    const QJsonObject object = QJsonDocument::fromJson(line).object();
    RenderJob job;
    job.title = object.value(TITLE).toString();
    job.folder = object.value(FOLDER).toString();
    job.pictures = PictureFiles::Pictures(object.value(PICTURES).toInt() & PictureFiles::ALL);
    if (job.title.isEmpty() || !job.pictures)
        return std::nullopt;
    return job;
}

#include "titlectl/RenderCommand.h"

#include "titlectl/Arguments.h"
#include "titlectl/FolderLocks.h"
#include "titlectl/Output.h"
#include "titlectl/RenderBatch.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace
{

const QString OUT = QStringLiteral("out");
const QString ONLY = QStringLiteral("only");

// Returns the name that two of the folders have; empty if there is none.
QString nameOfTwo(const QList<TitlePaths::Folder>& folders)
{
    QStringList names;
    for (const TitlePaths::Folder& folder : folders) {
        const QString name = QFileInfo(folder.path).fileName();
        if (names.contains(name))
            return name;
        names.append(name);
    }
    return {};
}

// Returns the folders that the jobs write to.
QStringList targetsOf(const QList<RenderJob>& jobs)
{
    QStringList targets;
    for (const RenderJob& job : jobs)
        if (!job.folder.isEmpty() && !targets.contains(job.folder))
            targets.append(job.folder);
    return targets;
}

} // namespace

QString RenderCommand::summary() const
{
    return QStringLiteral("makes the four pictures of title files, or of all titles of folders");
}

QList<CommandOption> RenderCommand::options() const
{
    return {{OUT, QStringLiteral("DIR"), QStringLiteral("write the pictures there, not beside the titles")},
            RenderBatch::jobsOption(),
            {ONLY, QStringLiteral("WIDTH"), QStringLiteral("make one size only: 1920, 960 or 240")},
            forceOption()};
}

std::optional<PictureFiles::Pictures> RenderCommand::picturesOf(const QString& only)
{
    if (only.isEmpty())
        return PictureFiles::Pictures(PictureFiles::ALL);
    if (only == QLatin1String("1920"))
        return PictureFiles::Big;
    if (only == QLatin1String("960"))
        return PictureFiles::Middle;
    if (only == QLatin1String("240"))
        return PictureFiles::Reduced;
    return std::nullopt;
}

QList<RenderJob> RenderCommand::jobsFor(const QList<TitlePaths::Folder>& folders, const QString& out,
                                        PictureFiles::Pictures pictures)
{
    QList<RenderJob> jobs;
    for (const TitlePaths::Folder& folder : folders) {
        QString target = out;
        if (!out.isEmpty() && folders.size() > 1)
            target += QLatin1Char('/') + QFileInfo(folder.path).fileName();
        for (const QString& title : folder.titles)
            jobs.append({title, target, pictures});
    }
    return jobs;
}

int RenderCommand::run(const Arguments& arguments, Output& output)
{
    const auto refuse = [&output](const QString& reason) {
        output.message(reason);
        return WrongUse;
    };
    const std::optional<PictureFiles::Pictures> pictures = picturesOf(arguments.value(ONLY));
    if (!pictures)
        return refuse(QStringLiteral("--only expects 1920, 960 or 240"));
    const std::optional<int> processes = RenderBatch::processesOf(arguments.value(RenderBatch::JOBS));
    if (!processes)
        return refuse(
            QStringLiteral("--jobs expects a number from 1 to %1").arg(RenderBatch::MOST_PROCESSES));
    const TitlePaths paths(arguments.operands());
    if (!paths.isValid())
        return refuse(paths.error());
    const QString out =
        arguments.has(OUT) ? QDir::cleanPath(QFileInfo(arguments.value(OUT)).absoluteFilePath()) : QString();
    if (const QString name = nameOfTwo(paths.folders()); !out.isEmpty() && !name.isEmpty())
        return refuse(QStringLiteral("two folders are named %1; --out would mix their pictures").arg(name));
    const QList<RenderJob> jobs = jobsFor(paths.folders(), out, *pictures);
    FolderLocks locks;
    const auto kind = out.isEmpty() ? FolderLock::Kind::Exclusive : FolderLock::Kind::Shared;
    const auto inUse = arguments.has(FORCE) ? FolderLocks::InUse::GoOn : FolderLocks::InUse::Refuse;
    if (!locks.take(paths.folderPaths(), kind, inUse, output))
        return WrongUse;
    for (const QString& target : targetsOf(jobs))
        if (!QDir().mkpath(target))
            return refuse(QStringLiteral("cannot make the folder %1").arg(target));
    int done = 0;
    const QStringList errors =
        RenderBatch::run(jobs, *processes, [&] { output.progress(++done, static_cast<int>(jobs.size())); });
    return report(jobs, errors, output);
}

int RenderCommand::report(const QList<RenderJob>& jobs, const QStringList& errors, Output& output)
{
    QJsonArray titles;
    int failed = 0;
    for (qsizetype i = 0; i < jobs.size(); ++i) {
        const QString& title = jobs.at(i).title;
        titles.append(QJsonObject{{QStringLiteral("file"), title}, {QStringLiteral("error"), errors.at(i)}});
        if (errors.at(i).isEmpty())
            continue;
        ++failed;
        output.message(QStringLiteral("%1: %2").arg(title, errors.at(i)));
    }
    output.line(QStringLiteral("%1 of %2 titles rendered").arg(jobs.size() - failed).arg(jobs.size()));
    output.json(
        QJsonDocument(QJsonObject{{QStringLiteral("titles"), titles}, {QStringLiteral("failed"), failed}}));
    return failed > 0 ? Findings : Success;
}

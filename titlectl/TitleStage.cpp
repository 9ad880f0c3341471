#include "titlectl/TitleStage.h"

#include "library/TitleFileOperations.h"

#include <QDir>
#include <QFile>
#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstring>

namespace
{

const QString PREFIX = QStringLiteral(".titlectl-");

// Returns the folder, without the stages of killed processes.
QString swept(const QString& folder)
{
    const QStringList stages = TitleStage::abandonedIn(folder);
    for (const QString& stage : stages)
        QDir(folder + QLatin1Char('/') + stage).removeRecursively();
    return folder;
}

// Returns the position of a file in the order in which the files of a title are moved.
int rankOf(const QString& file)
{
    if (file.contains(QLatin1String("_source_")))
        return 0;
    return file.endsWith(TitleFileOperations::XML_EXTENSION) ? 1 : 2;
}

} // namespace

TitleStage::TitleStage(const QString& folder)
    : m_folder(swept(folder)), m_stage(folder + QLatin1Char('/') + PREFIX + QStringLiteral("XXXXXX"))
{
    if (isValid())
        m_lock.take(path().toStdString(), FolderLock::Kind::Exclusive);
}

QStringList TitleStage::abandonedIn(const QString& folder)
{
    QStringList stages =
        QDir(folder).entryList({PREFIX + QLatin1Char('*')}, QDir::Dirs | QDir::Hidden | QDir::NoSymLinks);
    stages.removeIf([&](const QString& stage) {
        const QString path = folder + QLatin1Char('/') + stage;
        return FolderLock().take(path.toStdString(), FolderLock::Kind::Exclusive) == FolderLock::Result::Busy;
    });
    return stages;
}

QStringList TitleStage::filesOf(const QString& stem) const
{
    QStringList files;
    const QStringList all = QDir(m_stage.path()).entryList(QDir::Files | QDir::Hidden);
    for (const QString& file : all)
        if (stem.isEmpty() || file == stem + TitleFileOperations::XML_EXTENSION ||
            file.startsWith(stem + QLatin1Char('_')))
            files.append(file);
    std::stable_sort(files.begin(), files.end(),
                     [](const QString& a, const QString& b) { return rankOf(a) < rankOf(b); });
    return files;
}

QString TitleStage::place(const QString& stem) const
{
    const QStringList files = filesOf(stem);
    for (const QString& file : files) {
        const QByteArray from = QFile::encodeName(m_stage.filePath(file));
        const QByteArray to = QFile::encodeName(m_folder + QLatin1Char('/') + file);
        if (std::rename(from.constData(), to.constData()) != 0) {
            const QString reason = QString::fromLocal8Bit(std::strerror(errno));
            drop(stem);
            return QStringLiteral("%1: %2").arg(file, reason);
        }
    }
    return {};
}

void TitleStage::drop(const QString& stem) const
{
    const QStringList files = filesOf(stem);
    for (const QString& file : files)
        QFile::remove(m_stage.filePath(file));
}

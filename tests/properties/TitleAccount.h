#pragma once

#include "document/TitleParser.h"
#include "tests/library/TemplateFixture.h"

#include <QDirIterator>
#include <QMap>
#include <QSet>
#include <sys/stat.h>

// Checks the title folders on the disk for lost titles. Folders are identified by inode, so a renamed folder
// is the same one. A title may only be missing after titleMayGo() or folderGoes().
class TitleAccount
{
public:
    explicit TitleAccount(const TemplateFixture& files) : m_files(files) {}

    static QStringList stemsIn(const QString& folder)
    {
        QStringList stems;
        const QFileInfoList files = QDir(folder).entryInfoList({QStringLiteral("*.xml")}, QDir::Files);
        for (const QFileInfo& file : files)
            stems.append(file.completeBaseName());
        return stems;
    }

    void titleMayGo(const QString& folder, const QString& stem) { m_mayGo[inodeOf(folder)].insert(stem); }
    void folderGoes(const QString& folder)
    {
        m_titles.remove(inodeOf(folder));
        m_mayGo.remove(inodeOf(folder));
    }

    // Returns what was lost since the last call and which files cannot be read; empty when there are no
    // problems.
    QString look(bool withPictures)
    {
        QStringList wrong;
        QMap<ino_t, QStringList> now;
        const QFileInfoList folders =
            QDir(m_files.titleRoot()).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot);
        for (const QFileInfo& folder : folders) {
            const QStringList stems = stemsIn(folder.filePath());
            const ino_t inode = inodeOf(folder.filePath());
            now[inode] = stems;
            for (const QString& stem : m_titles.value(inode))
                if (!stems.contains(stem) && !m_mayGo[inode].contains(stem))
                    wrong.append(QString("lost: %1 of %2").arg(stem, folder.fileName()));
        }
        for (auto known = m_titles.keyBegin(); known != m_titles.keyEnd(); ++known)
            if (!now.contains(*known))
                wrong.append(QString("lost: a folder with %1").arg(m_titles.value(*known).join(' ')));
        m_titles = now;
        for (const QString& root : {m_files.titleRoot(), m_files.userRoot()})
            readAll(root, withPictures, wrong);
        return wrong.join('\n');
    }

    int titlesRead() const { return m_titlesRead; }
    int picturesRead() const { return m_picturesRead; }
    int titlesNow() const
    {
        int count = 0;
        for (const QStringList& stems : m_titles)
            count += int(stems.size());
        return count;
    }

private:
    struct Stamp {
        ino_t inode = 0;
        qint64 time = 0;
        bool operator==(const Stamp&) const = default;
    };

    static struct stat statusOf(const QString& path)
    {
        struct stat status = {};
        ::stat(path.toLocal8Bit().constData(), &status);
        return status;
    }
    static ino_t inodeOf(const QString& path) { return statusOf(path).st_ino; }

    // Returns whether the file was written since the last call.
    bool isNew(const QString& path)
    {
        const struct stat status = statusOf(path);
        const Stamp stamp{status.st_ino, status.st_mtim.tv_sec * 1000000000LL + status.st_mtim.tv_nsec};
        return !(std::exchange(m_stamps[path], stamp) == stamp);
    }

    void readAll(const QString& root, bool withPictures, QStringList& wrong)
    {
        QDirIterator files(root, {"*.xml", "*.png"}, QDir::Files, QDirIterator::Subdirectories);
        while (files.hasNext()) {
            const QString path = files.next();
            const bool isTitle = path.endsWith(QLatin1String(".xml"));
            if (isTitle && files.fileInfo().path() == root)
                continue; // a settings file
            if ((!isTitle && !withPictures) || !isNew(path))
                continue;
            const bool isWhole = isTitle ? readTitle(path) : !QImage(path).isNull();
            ++(isTitle ? m_titlesRead : m_picturesRead);
            if (!isWhole && QFile::exists(path)) // otherwise the file has just been renamed over another one
                wrong.append("cannot be read: " + path);
        }
    }
    static bool readTitle(const QString& path)
    {
        Archive archive;
        return TitleParser().readOneTitle(path.toStdString(), &archive) == 1;
    }

    const TemplateFixture& m_files;
    QMap<ino_t, QStringList> m_titles;
    QMap<ino_t, QSet<QString>> m_mayGo;
    QMap<QString, Stamp> m_stamps;
    int m_titlesRead = 0;
    int m_picturesRead = 0;
};

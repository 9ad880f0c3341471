#pragma once

#include "LibraryFixture.h"

#include "document/ArchiveManager.h"
#include "document/TemplateManager.h"
#include "document/UserTemplateManager.h"
#include "support/FileSyncQueue.h"

#include <QDateTime>

// Template folders in addition to the title folders of LibraryFixture.
class TemplateFixture : public LibraryFixture
{
public:
    QString presetRoot() const { return base() + QStringLiteral("/templates"); }
    QString userRoot() const { return base() + QStringLiteral("/usertemplates"); }
    QString userTitle(const QString& name) const
    {
        return userRoot() + QLatin1Char('/') + name + QStringLiteral("/Titler.xml");
    }

    // Removes the templates from both folders and resets the managers that have read them.
    void resetTemplates()
    {
        FileSyncQueue::flush(std::chrono::seconds(30));
        TemplateManager::cleanUp();
        UserTemplateManager::cleanUp();
        for (const QString& folder : {presetRoot(), userRoot()}) {
            QDir(folder).removeRecursively();
            QDir().mkpath(folder);
        }
        for (const char* set : {"/templates_en", "/templates_chs"})
            QDir().mkpath(presetRoot() + QLatin1String(set));
        m_age = 0;
    }

    // Makes presets with these stems, the only ones listed in the order file of the set.
    void makePresets(const QString& set, const QStringList& stems, bool hasBackground = false) const
    {
        const QString folder = presetRoot() + QLatin1Char('/') + set;
        for (const QString& stem : stems) {
            const auto archive = makeRecord(folder, stem, stem);
            if (hasBackground) {
                archive->setBgResource((folder + QStringLiteral("/bg_1280.png")).toStdString());
                archive->setBgResourceBig((folder + QStringLiteral("/bg_1920.png")).toStdString());
            }
            ArchiveManager().saveArchive(archive.get());
            picture(Qt::blue).save(folder + QLatin1Char('/') + stem + QStringLiteral("_240.png"));
        }
        if (hasBackground)
            for (const char* name : {"/bg_1280.png", "/bg_1920.png"})
                picture(Qt::gray).save(folder + QLatin1String(name));
        writeOrder(folder, stems);
    }

    // Makes a user template that is newer than the previous ones. The manager lists it after its next start.
    void makeUserTemplate(const QString& name, const QStringList& texts = {QStringLiteral("text")})
    {
        const QString folder = userRoot() + QLatin1Char('/') + name;
        QDir().mkpath(folder);
        Archive archive;
        archive.setPath(userTitle(name).toStdString());
        archive.setThumbnailSmall("Titler_240.png");
        archive.setBgResource("Titler_source_1280.png");
        archive.setBgResourceBig("Titler_source_1920.png");
        std::vector<TText*> records;
        for (const QString& text : texts)
            records.push_back(makeText(text, static_cast<int>(records.size()) + 1));
        archive.setText(records);
        ArchiveManager().saveArchive(&archive);
        makeUserPictures(name);
        QFile file(userTitle(name));
        if (file.open(QIODevice::ReadWrite))
            file.setFileTime(QDateTime::fromSecsSinceEpoch(1000 + ++m_age), QFile::FileModificationTime);
    }

    void makeUserTemplates(int count)
    {
        for (int i = 1; i <= count; ++i)
            makeUserTemplate(QStringLiteral("UserTemplate_%1").arg(i, 3, 10, QLatin1Char('0')));
    }

    void makeUserPictures(const QString& name) const
    {
        const QString folder = userRoot() + QLatin1Char('/') + name;
        QDir().mkpath(folder);
        for (const char* file : {"/Titler_240.png", "/Titler_source_1280.png", "/Titler_source_1920.png"})
            picture(Qt::green).save(folder + QLatin1String(file));
    }

    // Returns the names in the order file of the user templates.
    QStringList userOrder() const
    {
        ArchiveController controller;
        QStringList names;
        for (const ArchiveOrder* row : controller.getFileOrder(userRoot()))
            names.append(QString::fromStdString(row->getArchivePath()).section(QLatin1Char('/'), 0, 0));
        return names;
    }

private:
    QString base() const { return QFileInfo(titleRoot()).path(); }

    static QImage picture(Qt::GlobalColor color)
    {
        QImage image(240, 135, QImage::Format_ARGB32);
        image.fill(color);
        return image;
    }

    int m_age = 0;
};

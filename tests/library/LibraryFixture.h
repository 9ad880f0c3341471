// A data path for one test program, with title folders, and fakes of what the title library reports to.
#pragma once

#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "support/FileSyncQueue.h"
#include "tests/fakes/FakeEditContext.h"
#include "tests/fakes/FakeMessageBoxController.h"
#include "tests/fakes/FakeTitleChangeReporter.h"
#include "tests/fakes/FakeTitlerFolderReporter.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QPair>
#include <QStringList>
#include <QTemporaryDir>
#include <chrono>
#include <memory>
#include <string>
#include <vector>

// Make one that exists as long as the test program, since the paths are read from the environment only once.
class LibraryFixture
{
public:
    LibraryFixture()
    {
        qputenv("K2SYS_AC_ROOT", "");
        qputenv("K2SYS_AC_DATA", m_dir.path().toLocal8Bit());
        const QString base = m_dir.path() + QStringLiteral("/defaultuser/");
        QDir().mkpath(base);
        QFile paths(base + QStringLiteral("PathInfo.xml"));
        if (paths.open(QIODevice::WriteOnly))
            paths.write("<?xml version=\"1.0\"?><PathInfo><TitleResource path=\"titles\"/>"
                        "<SystemSetting path=\"settings\"/><TitlerTemplate path=\"usertemplates\"/>"
                        "<Template path=\"templates\"/><Font path=\"fonts\"/></PathInfo>");
        QDir().mkpath(base + QStringLiteral("titles"));
        QDir().mkpath(base + QStringLiteral("settings"));
        QDir().mkpath(base + QStringLiteral("resources/Templates"));
        checker().save(base + QStringLiteral("resources/Templates/checker_240x135.png"));
    }

    // Returns the checker pattern behind the small pictures.
    static QImage checker()
    {
        QImage image(240, 135, QImage::Format_RGB32);
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x)
                image.setPixelColor(x, y,
                                    (x / 15 + y / 15) % 2 ? QColor(153, 153, 153) : QColor(102, 102, 102));
        }
        return image;
    }

    QString titleRoot() const { return m_dir.path() + QStringLiteral("/defaultuser/titles"); }

    QString makeFolder(const QString& name)
    {
        const QString path = titleRoot() + QLatin1Char('/') + name;
        FileSyncQueue::flush(std::chrono::seconds(30)); // keeps versions in the folders until then
        QDir(path).removeRecursively();
        QDir().mkpath(path);
        return path;
    }

    // Makes a text object with one style per character.
    static TText* makeText(const QString& text, int id, float x = 100, float y = 100)
    {
        auto* record = new TText;
        record->setTextObjectID(id);
        record->setText(text.toStdString());
        record->setXValue(x);
        record->setYValue(y);
        record->setZValue(1.0F);
        std::vector<TextStyle*> styles;
        for (const QChar c : text) {
            auto* style = new TextStyle;
            style->setText(QString(c).toStdString());
            styles.push_back(style);
        }
        record->setTextItems(styles);
        return record;
    }

    // Returns the record of a title with this stem and one text object with the text.
    static std::unique_ptr<Archive> makeRecord(const QString& folder, const QString& stem,
                                               const QString& text)
    {
        auto archive = std::make_unique<Archive>();
        archive->setName(stem.toStdString());
        archive->setPath((folder + QLatin1Char('/') + stem + QStringLiteral(".xml")).toStdString());
        archive->setThumbnailBig((stem + QStringLiteral("_1920.png")).toStdString());
        archive->setThumbnailMiddle((stem + QStringLiteral("_960.png")).toStdString());
        archive->setThumbnailSmall((stem + QStringLiteral("_240.png")).toStdString());
        archive->setThumbnailBlack((stem + QStringLiteral("_240S.png")).toStdString());
        if (!text.isEmpty())
            archive->setText({makeText(text, 1)});
        return archive;
    }

    // Writes title files with these stems, each with its stem as text and a red picture for each of the four,
    // and an order file.
    static void fillFolder(const QString& folder, const QStringList& stems)
    {
        ArchiveController controller;
        for (const QString& stem : stems) {
            const auto archive = makeRecord(folder, stem, stem);
            controller.saveNewArchive(folder, archive.get());
            QImage small(240, 135, QImage::Format_ARGB32);
            small.fill(Qt::red);
            for (const char* suffix : {"_240.png", "_240S.png", "_960.png", "_1920.png"})
                small.save(folder + QLatin1Char('/') + stem + QLatin1String(suffix));
        }
        writeOrder(folder, stems);
    }

    static void writeOrder(const QString& folder, const QStringList& stems)
    {
        ArchiveController controller;
        QList<ArchiveOrder*> rows;
        for (const QString& stem : stems) {
            auto* row = new ArchiveOrder;
            row->setArchiveIndex(static_cast<int>(rows.size()));
            if (!stem.isEmpty())
                row->setArchivePath((stem + QStringLiteral(".xml")).toStdString());
            rows.append(row);
        }
        controller.saveArchiveListOrder(folder, rows);
        qDeleteAll(rows);
    }

    // Returns the stems in the order file.
    static QStringList order(const QString& folder)
    {
        ArchiveController controller;
        QStringList stems;
        for (const ArchiveOrder* row : controller.getFileOrder(folder))
            stems.append(QFileInfo(QString::fromStdString(row->getArchivePath())).completeBaseName());
        return stems;
    }

private:
    QTemporaryDir m_dir;
};

using Reports = QList<QPair<int, QString>>;

#pragma once

#include "tests/library/LibraryFixture.h"
#include "titlectl/TitleRenderer.h"

#include <QByteArray>
#include <QFile>
#include <QMap>
#include <QString>
#include <QStringList>

// Makes a folder of titles that nothing is wrong with: each has its stem as text, its pictures, and a row of
// the order.
inline QString renderedFolder(LibraryFixture& fixture, const QString& name, const QStringList& stems)
{
    const QString folder = fixture.makeFolder(name);
    TitleRenderer renderer;
    for (const QString& stem : stems) {
        const auto archive = LibraryFixture::makeRecord(folder, stem, stem);
        ArchiveController().saveNewArchive(folder, archive.get());
        RenderJob job;
        job.title = QString::fromStdString(archive->getPath());
        if (!renderer.render(job).isEmpty())
            qFatal("a title is not rendered");
    }
    LibraryFixture::writeOrder(folder, stems);
    FileSyncQueue::flush(std::chrono::seconds(30)); // keeps versions in the folder until then
    return folder;
}

// Returns the bytes of the pictures in a folder by their names.
inline QMap<QString, QByteArray> picturesIn(const QString& folder)
{
    QMap<QString, QByteArray> pictures;
    const QStringList names = QDir(folder).entryList({QStringLiteral("*.png")}, QDir::Files);
    for (const QString& name : names) {
        QFile file(folder + QLatin1Char('/') + name);
        if (file.open(QIODevice::ReadOnly))
            pictures.insert(name, file.readAll());
    }
    return pictures;
}

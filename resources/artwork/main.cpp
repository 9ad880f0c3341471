// Paints the program's pictures at build time.
//
//   titler_artwork COLLECTION FOLDER   the pictures of a resource collection and FOLDER/COLLECTION.qrc
//   titler_artwork --look FOLDER       pages that show them all, and put together, to be looked at
#include "resources/artwork/ArtworkTable.h"
#include "resources/artwork/Specimen.h"

#include <QDir>
#include <QFileInfo>
#include <QGuiApplication>
#include <QImage>
#include <QPainter>
#include <QSaveFile>

#include <cstdio>

namespace
{

QImage paint(const Picture& picture)
{
    QImage image(picture.size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    picture.draw(painter);
    return image;
}

bool writeCollection(const QString& collection, const QDir& folder)
{
    QByteArray list = "<RCC><qresource prefix=\"/\">\n";
    for (const Picture& picture : artworkTable()) {
        if (picture.collection != collection) {
            continue;
        }
        const QString path =
            folder.filePath(collection + QLatin1Char('/') + picture.name + QStringLiteral(".png"));
        if (!QDir().mkpath(QFileInfo(path).path()) || !paint(picture).save(path, "PNG")) {
            std::fprintf(stderr, "cannot write %s\n", qPrintable(path));
            return false;
        }
        list +=
            QStringLiteral("<file alias=\"%1\">%2/%1.png</file>\n").arg(picture.name, collection).toUtf8();
    }
    list += "</qresource></RCC>\n";
    QSaveFile file(folder.filePath(collection + QStringLiteral(".qrc")));
    return file.open(QIODevice::WriteOnly) && file.write(list) == list.size() && file.commit();
}

bool writeSpecimens(const QDir& folder)
{
    return QDir().mkpath(folder.path()) &&
           Specimen::sheet().save(folder.filePath(QStringLiteral("sheet.png"))) &&
           Specimen::faces().save(folder.filePath(QStringLiteral("faces.png"))) &&
           Specimen::frames().save(folder.filePath(QStringLiteral("frames.png")));
}

} // namespace

int main(int argc, char** argv)
{
    const QGuiApplication app(argc, argv);
    const QStringList arguments = QGuiApplication::arguments();
    if (arguments.size() != 3) {
        std::fprintf(stderr, "usage: titler_artwork COLLECTION FOLDER | --look FOLDER\n");
        return 2;
    }
    const bool done = arguments.at(1) == QLatin1String("--look")
                          ? writeSpecimens(QDir(arguments.at(2)))
                          : writeCollection(arguments.at(1), QDir(arguments.at(2)));
    return done ? 0 : 1;
}

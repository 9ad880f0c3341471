// Paints the program's pictures at build time.
//
//   titler_artwork COLLECTION FOLDER   the pictures of a resource collection and FOLDER/COLLECTION.qrc
//   titler_artwork --sheet FILE        one picture that shows them all, to be looked at
#include "resources/artwork/ArtworkTable.h"
#include "resources/artwork/DesignTokens.h"

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

bool writeSheet(const QString& path)
{
    constexpr int WIDTH = 1500;
    constexpr int GAP = 14;
    constexpr int LABEL = 12;
    constexpr int LARGEST = 320;
    QImage sheet(WIDTH, 2400, QImage::Format_RGB32);
    sheet.fill(Tokens::PANEL);
    QPainter painter(&sheet);
    painter.setPen(QColor(150, 150, 150));
    QFont font = painter.font();
    font.setPixelSize(9);
    painter.setFont(font);
    QPoint at(GAP, GAP);
    int rowHeight = 0;
    for (const Picture& picture : artworkTable()) {
        QImage image = paint(picture);
        if (image.width() > LARGEST) {
            image = image.scaledToWidth(LARGEST, Qt::SmoothTransformation);
        }
        const int cell = qMax(image.width(), 150);
        if (at.x() + cell > WIDTH) {
            at = QPoint(GAP, at.y() + rowHeight + LABEL + GAP);
            rowHeight = 0;
        }
        painter.drawImage(at, image);
        painter.drawText(QRect(at.x(), at.y() + image.height() + 1, cell + GAP, LABEL), Qt::AlignLeft,
                         picture.name.section(QLatin1Char('/'), -1));
        rowHeight = qMax(rowHeight, image.height());
        at.rx() += cell + GAP;
    }
    return sheet.copy(0, 0, WIDTH, at.y() + rowHeight + LABEL + GAP).save(path, "PNG");
}

} // namespace

int main(int argc, char** argv)
{
    const QGuiApplication app(argc, argv);
    const QStringList arguments = QGuiApplication::arguments();
    if (arguments.size() != 3) {
        std::fprintf(stderr, "usage: titler_artwork COLLECTION FOLDER | --sheet FILE\n");
        return 2;
    }
    const bool done = arguments.at(1) == QLatin1String("--sheet")
                          ? writeSheet(arguments.at(2))
                          : writeCollection(arguments.at(1), QDir(arguments.at(2)));
    return done ? 0 : 1;
}

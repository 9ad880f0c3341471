#pragma once

#include <QList>
#include <QSize>
#include <QString>

#include <functional>

class QPainter;

// One picture of the program: under which resource path it is compiled in, how large it is and how it is
// painted.
struct Picture {
    QString collection; // resource collection
    QString name;       // resource path without ":/"
    QSize size;
    std::function<void(QPainter&)> draw;
};

inline const QString TOOL_COLLECTION = QStringLiteral("TitlerToolResource");
inline const QString WIDGET_COLLECTION = QStringLiteral("UILibrary");

// Adds the pieces of a frame that is cut from one drawing: corners of the given size, the rest between them.
// Names are in the order upper left, centre, right, middle left, centre, right, bottom left, centre, right.
void addNineSlice(QList<Picture>& table, const QString& collection, const QString& prefix,
                  const QStringList& names, const QSize& corner,
                  const std::function<void(QPainter&, const QSize&)>& drawWhole);
// Adds left, centre and right piece of a drawing of the height; the ends are cap pixels wide.
void addThreeSlice(QList<Picture>& table, const QString& collection, const QStringList& names, int height,
                   int cap, const std::function<void(QPainter&, const QSize&)>& drawWhole);

#pragma once

#include <QList>
#include <QRect>
#include <QSize>
#include <QString>
#include <QStringList>

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

// Paints a whole of any size, from which pieces are cut.
using DrawWhole = std::function<void(QPainter&, const QSize&)>;

inline const QString TOOL_COLLECTION = QStringLiteral("TitlerToolResource");
inline const QString WIDGET_COLLECTION = QStringLiteral("UILibrary");

// "_Upper_Left" and so on, in the order of addNineSlice().
QStringList nineNames();

// A picture that is painted over its whole size.
Picture sizedPicture(const QString& collection, const QString& name, const QSize& size,
                     const DrawWhole& drawWhole);
// The part of a whole.
Picture cutPicture(const QString& collection, const QString& name, const QRect& part, const QSize& whole,
                   const DrawWhole& drawWhole);
// Adds the pieces of a frame that is cut from one drawing: corners of the given size, the rest between them.
// Names are in the order upper left, centre, right, middle left, centre, right, bottom left, centre, right.
void addNineSlice(QList<Picture>& table, const QString& collection, const QString& prefix,
                  const QStringList& names, const QSize& corner, const DrawWhole& drawWhole);
// Adds left, centre and right piece of a drawing of the height; the ends are cap pixels wide.
void addThreeSlice(QList<Picture>& table, const QString& collection, const QStringList& names, int height,
                   int cap, const DrawWhole& drawWhole);
// Adds upper, centre and lower piece of a drawing of the width; the ends are cap pixels high.
void addThreeSliceDown(QList<Picture>& table, const QString& collection, const QStringList& names, int width,
                       int cap, const DrawWhole& drawWhole);

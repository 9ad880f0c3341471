#pragma once

#include <QColor>
#include <QImage>
#include <QRect>
#include <QSize>
#include <QString>

// Measures how pictures look.
namespace PictureMeasures
{

// Returns the contrast of two opaque colours, from 1 to 21, by their relative luminance.
double contrast(const QColor& one, const QColor& other);
// Returns the distance of two colours in the CIE L*a*b* space; about 2 is just visible side by side.
double difference(const QColor& one, const QColor& other);
// Returns the mean colour of an area of an opaque picture.
QColor mean(const QImage& image, const QRect& area);
// Returns the largest difference that any square of the given side has between two opaque pictures of equal
// size.
double largestDifference(const QImage& one, const QImage& other, int side);

// Returns the picture on a background of one colour.
QImage on(const QColor& ground, const QImage& picture);
// Returns the most frequent colour of the picture's opaque pixels.
QColor inkOf(const QImage& picture);
// Returns the smallest rectangle around the pixels that are at least half opaque.
QRect inkRect(const QImage& picture);

enum class Scaling { Nearest, Smooth };

// Returns three pieces side by side as a button paints them: the ends in their size, the centre between them.
QImage threePieces(const QString& base, const QStringList& names, const QSize& size, Scaling scaling);
// Returns three pieces one below the other.
QImage threePiecesDown(const QString& base, const QStringList& names, const QSize& size, Scaling scaling);
// Returns the nine pieces "PREFIXUpper_Left" and so on as one picture.
QImage ninePieces(const QString& prefix, const QSize& size, Scaling scaling);

// Returns the largest step of a channel between neighbouring pixels, along the columns from..to of any row
// and along the rows from..to of any column.
int largestStepAcross(const QImage& image, int from, int to);
int largestStepDown(const QImage& image, int from, int to);

} // namespace PictureMeasures

#pragma once

#include <QColor>
#include <QImage>
#include <QRect>
#include <QSize>
#include <QString>

// What the eye makes of pictures, as numbers.
namespace PictureMeasures
{

// Of two opaque colours, from 1 to 21, by their relative luminance.
double contrast(const QColor& one, const QColor& other);
// Distance of two colours in the CIE L*a*b* space; about 2 is just noticed side by side.
double difference(const QColor& one, const QColor& other);
// The mean colour of an area of an opaque picture.
QColor mean(const QImage& image, const QRect& area);
// The largest difference that any square of the given side shows between two opaque pictures of one size.
double largestDifference(const QImage& one, const QImage& other, int side);

// The picture lying on a colour.
QImage on(const QColor& ground, const QImage& picture);
// The colour that most of a picture's opaque pixels have.
QColor inkOf(const QImage& picture);
// The smallest rectangle around what is at least half opaque.
QRect inkRect(const QImage& picture);

enum class Scaling { Nearest, Smooth };

// Three pieces side by side as a button paints them: the ends at their size, the centre between them.
QImage threePieces(const QString& base, const QStringList& names, const QSize& size, Scaling scaling);
// Three pieces one below the other.
QImage threePiecesDown(const QString& base, const QStringList& names, const QSize& size, Scaling scaling);
// Nine pieces "PREFIXUpper_Left" and so on.
QImage ninePieces(const QString& prefix, const QSize& size, Scaling scaling);

// The largest step of a channel between neighbours along the columns from..to of any row, and along the rows
// from..to of any column.
int largestStepAcross(const QImage& image, int from, int to);
int largestStepDown(const QImage& image, int from, int to);

} // namespace PictureMeasures

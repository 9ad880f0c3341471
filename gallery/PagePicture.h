#pragma once

#include <QImage>
#include <QString>
#include <QStringList>

class QWidget;

// Pictures of pages, and the digests by which they are compared: a grid of average colours, as text, small
// enough to be kept with the sources.
namespace PagePicture
{

constexpr int COLUMNS = 64;
constexpr int ROWS = 36;

// The window with all other windows of this process that show over it, menus and balloons among them.
QImage shoot(QWidget* window);

// One line a row of the grid, each cell as six hexadecimal digits. The picture may have any size.
QStringList digest(const QImage& picture);

struct Difference {
    bool sameShape = false; // both are whole digests
    int worst = 0;          // the largest difference of a colour part, 0 to 255
    int cells = 0;          // cells that differ by more than the tolerance
    double mean = 0;        // over all colour parts
};

Difference compare(const QStringList& kept, const QStringList& seen, int tolerance);
// The cells that differ by more than the tolerance in red over the dimmed picture.
QImage explain(const QImage& picture, const QStringList& kept, int tolerance);

} // namespace PagePicture
